// Any bytes as a record stream: what was read is a whole record, which comes back as it is.

#include <cstdint>
#include <cstdlib>
#include <sstream>
#include <string>

#include "CableInfo.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::istringstream in(std::string(reinterpret_cast<const char*>(data), size));
    CableInfo cable;
    cable.readStream(in);
    std::stringstream form;
    cable.writeStream(form);
    CableInfo again;
    again.readStream(form);
    std::ostringstream second;
    again.writeStream(second);
    if (form.fail() || second.str() != form.str()) {
        std::abort();
    }
    return 0;
}
