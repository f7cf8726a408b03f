#include "platform/StreamSocket.h"

namespace platform {
namespace {

SocketHost* replacement = nullptr;

}  // namespace

SocketHost& socketHost() {
    return replacement != nullptr ? *replacement : realSocketHost();
}

void replaceSocketHost(SocketHost* host) {
    replacement = host;
}

}  // namespace platform
