// What a debugger is to show; it stops at shown().
#include <cstring>
#include <utility>

#include "HkString.h"
#include "Register.h"
#include "bits/Model.h"

const unsigned char bytes[] = {0xA5, 0x0C};

HkString text("device \"7\"");
HkString emptyText;
HkString textWithZero(std::string_view("a\0b", 3));
HkString longText;
HkString movedText("moved");
alignas(HkString) unsigned char noText[sizeof(HkString)];

LRBitVec left(bytes, 12);
LRBitVec emptyLeft;
LRBitVec movedLeft(bytes, 12);
LRBitVec longLeft(1000, true);
RLBitVec right(bytes, 12);
RLBitVec longRight(1001);
NumberedVec forward(right, Numbering::Forward);
NumberedVec byteMirror(right, Numbering::Mirrored);
alignas(RLBitVec) unsigned char noVector[sizeof(RLBitVec)];
alignas(RLBitVec) unsigned char wildVector[sizeof(RLBitVec)];

BitOperations bit(left[2]);
alignas(BitOperations) unsigned char noBit[sizeof(BitOperations)];

Register device(4, bytes, 8, bytes, 2, 1);
Register emptyDevice;

void shown() {}

int main() {
    longText.Insert(0, 'x', 1000);
    const HkString newText(std::move(movedText));
    const LRBitVec newLeft(std::move(movedLeft));
    longRight.setBit(1);
    std::memset(wildVector, 0x55, sizeof wildVector);
    shown();
}
