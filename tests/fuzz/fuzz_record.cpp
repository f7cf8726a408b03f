// Any bytes as a record stream: what was read is a whole record, which comes back as it is.
#include <sstream>

#include "CableInfo.h"
#include "fuzz/Fuzz.h"

void fuzz(Input input) {
    std::istringstream in(std::string(input.bytes()));
    CableInfo cable;
    cable.readStream(in);
    std::stringstream form;
    cable.writeStream(form);
    CableInfo again;
    again.readStream(form);
    std::ostringstream second;
    again.writeStream(second);
    require(!form.fail() && second.str() == form.str());
}
