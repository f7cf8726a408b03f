// Owner of a file descriptor.
#pragma once

#include <unistd.h>

#include "platform/Owner.h"

namespace platform {

struct DescriptorRules {
    using Value = int;
    static int none() { return -1; }
    static bool isOpen(int number) { return number >= 0; }
    static bool close(int number) { return ::close(number) == 0; }
};

using Descriptor = Owner<DescriptorRules>;

}  // namespace platform
