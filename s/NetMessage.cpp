#include "NetMessage.h"

void NetMessage::readStream(std::istream& in) {
    Streamable::readStream(in);
}

void NetMessage::writeStream(std::ostream& out) {
    Streamable::writeStream(out);
}

bool NetMessage::execute(TessalSocket*) {
    return false;
}
