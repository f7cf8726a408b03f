#include "platform/LocalPipe.h"

namespace platform {
namespace {

PipeHost* replacement = nullptr;

}  // namespace

PipeHost& pipeHost() {
    return replacement != nullptr ? *replacement : realPipeHost();
}

void replacePipeHost(PipeHost* host) {
    replacement = host;
}

}  // namespace platform
