// System calls that a signal interrupted are made again.
#pragma once

#include <cerrno>

namespace platform {

template <class Call>
auto retried(Call call) {
    auto result = call();
    while (result == -1 && errno == EINTR) {
        result = call();
    }
    return result;
}

}  // namespace platform
