// Any bytes as hex, binary and plain text, as an array and as a vector, in any order and numbering, against the model.
#include "hex/HexChecks.h"

void fuzz(Input input) {
    require(HexChecks::allAgree(input));
}
