#include "HkStream.h"

#include <cstdio>

namespace HostKit {

HkStream& HkStream::console() {
    static HkStream& stream = *new HkStream;
    return stream;
}

HkStream& HkStream::operator<<(const char* text) {
    if (text != nullptr) {
        std::fputs(text, stdout);
    }
    return *this;
}

HkStream& HkStream::operator<<(int number) {
    std::printf("%d", number);
    return *this;
}

HkStream& HkStream::operator<<(HkStream& (*manipulator)(HkStream&)) {
    return manipulator != nullptr ? manipulator(*this) : *this;
}

HkStream& HkStream::endl(HkStream& stream) {
    std::fputc('\n', stdout);
    return stream;
}

}  // namespace HostKit
