#include "platform/SystemRestart.h"

namespace platform {

/// There is no dialogue that every such host has, and a restart is the affair of whoever administers it.
SystemRestart* realSystemRestart() {
    return nullptr;
}

}  // namespace platform
