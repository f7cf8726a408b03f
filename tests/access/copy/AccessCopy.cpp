// A second copy of the library in the process: a module with all its objects, which shares none of them.
#include <functional>
#include <memory>

#include "Access.h"

/// Opens a port: a call of @p lock locks it, and its end closes it.
extern "C" __attribute__((visibility("default"))) void copyOpen(int port, std::function<bool()>& lock) {
    lock = [access = std::make_shared<Access>(port, Access::SHARE)] { return access->lock(); };
}
