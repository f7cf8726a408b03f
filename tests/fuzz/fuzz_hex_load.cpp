// Any text loaded as hex, binary and plain text, in any order and numbering, against the model.
#include "hex/HexChecks.h"

void fuzz(Input input) {
    require(HexChecks::loadAgrees(input));
}
