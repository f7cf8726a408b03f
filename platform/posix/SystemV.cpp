#include "platform/posix/SystemV.h"

namespace SystemV {

Filter filter = nullptr;
thread_local const char* lastCall = "";

}  // namespace SystemV
