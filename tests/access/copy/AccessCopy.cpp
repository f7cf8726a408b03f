// A second copy of the library in the process: a module with all its objects, which shares none of them.
#include "Access.h"

extern "C" __attribute__((visibility("default"))) void* copyOpen(int port) {
    return new Access(port, Access::SHARE);
}

extern "C" __attribute__((visibility("default"))) bool copyLock(void* access) {
    return static_cast<Access*>(access)->lock();
}

extern "C" __attribute__((visibility("default"))) void copyClose(void* access) {
    delete static_cast<Access*>(access);
}
