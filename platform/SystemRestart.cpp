#include "platform/SystemRestart.h"

namespace platform {
namespace {

SystemRestart* replacement = nullptr;

}  // namespace

SystemRestart* systemRestart() {
    return replacement != nullptr ? replacement : realSystemRestart();
}

void replaceSystemRestart(SystemRestart* restart) {
    replacement = restart;
}

}  // namespace platform
