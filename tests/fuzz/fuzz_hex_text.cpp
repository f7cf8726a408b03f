// Any bytes to text and numbers, and any text and numbers to bits, against the model.
#include "hex/HexChecks.h"

void fuzz(Input input) {
    require(HexChecks::readingAgrees(input));
}
