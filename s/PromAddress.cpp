// The combined addresses of PromUtility.

#include <limits>

#include "Hex2Bit.h"
#include "HkStr.h"
#include "PromUtility.h"
#include "s/PromUtilityOrigin.h"

namespace {

constexpr std::size_t pinCount = 2;

/// The bit of that number; numbers count modulo 32, as processors shift.
unsigned int bit(int number) {
    return 1U << (static_cast<unsigned int>(number) % 32U);
}

const char* pinText(unsigned int combo, int number) {
    return (combo & bit(number)) != 0 ? "1" : "0";
}

unsigned int numberOf(const char* hexText) {
    return static_cast<unsigned int>(Hex2Bit::convertHexString2Int(hexText, static_cast<int>(HkStr::Len(hexText))));
}

HkString upperHex(unsigned int number) {
    HkString text;
    if (number > static_cast<unsigned int>(std::numeric_limits<int>::max())) {
        text.Format("%08X", number);  // Hex2Bit takes the number as a signed one
    } else {
        text = Hex2Bit::convertInt2HexString(static_cast<int>(number));
        text.MakeUpper();
    }
    return text;
}

}  // namespace

unsigned int PromUtility::GetRSPinAndStartAddressCombo(const char* rsPin, unsigned int start, int addressBits) {
    const std::size_t length = HkStr::Len(rsPin);
    if (length == 0) {
        return start;
    }
    if (length != pinCount) {
        promUtilityOrigin.report().issueInfo("Incorret length %d of input RS pin, expected 2.\n",
                                             static_cast<int>(length));
        return start;
    }
    const auto isSet = [](char pin) { return (static_cast<unsigned char>(pin) & 1U) != 0; };
    return start + (isSet(rsPin[0]) ? bit(addressBits - 1) : 0U) + (isSet(rsPin[1]) ? bit(addressBits - 2) : 0U);
}

HkString PromUtility::GetRSPinAndStartAddressCombo(const char* rsPin, const char* startHex, int addressBits) {
    return upperHex(GetRSPinAndStartAddressCombo(rsPin, numberOf(startHex), addressBits));
}

void PromUtility::DecomposeComboAddress(unsigned int combo, HkString& rsPin, unsigned int& start, int addressBits) {
    if (HkStr::ICompare(rsPin, "00") == 0) {
        start = combo;
        return;
    }
    rsPin = pinText(combo, addressBits - 1);
    rsPin += pinText(combo, addressBits - 2);
    start = combo % bit(addressBits - 2);
}

void PromUtility::DecomposeComboAddress(HkString comboHex, HkString& rsPin, HkString& startHex, int addressBits) {
    unsigned int start = 0;
    DecomposeComboAddress(numberOf(comboHex), rsPin, start, addressBits);
    startHex = upperHex(start);
}
