// The conversions of CableInfo that need no record: speeds, white space, port names.

#include <limits>

#include "CableInfo.h"
#include "HkStr.h"
#include "s/CableInfoOrigin.h"

namespace {

struct Speed {
    int hertz;
    const char* digits;
    const char* display;
};

constexpr Speed speeds[] = {
    {0, "0", "0"},
    {9600, "9600", "9600"},
    {19200, "19200", "19200"},
    {38400, "38400", "38400"},
    {57600, "57600", "57600"},
    {187000, "187000", "187 KHz"},
    {200000, "200000", "200 KHz"},
    {300000, "300000", "300 KHz"},
    {375000, "375000", "375 KHz"},
    {625000, "625000", "625 KHz"},
    {750000, "750000", "750 KHz"},
    {1250000, "1250000", "1.25 MHz"},
    {1500000, "1500000", "1.5 MHz"},
    {2500000, "2500000", "2.5 MHz"},
    {3000000, "3000000", "3 MHz"},
    {5000000, "5000000", "5 MHz"},
    {6000000, "6000000", "6 MHz"},
    {10000000, "10000000", "10 MHz"},
    {12000000, "12000000", "12 MHz"},
    {24000000, "24000000", "24 MHz"},
};

const Speed* findSpeed(int hertz, int line = __builtin_LINE()) {
    for (const Speed& speed : speeds) {
        if (speed.hertz == hertz) {
            return &speed;
        }
    }
    cableInfoOrigin.report(line).issueInfo("Invalid speed %d.\n", hertz);
    return nullptr;
}

/// How the number of a port stands in its name.
enum class Numbering {
    None,          ///< there is no number: -1
    FromOne,       ///< decimal, counted from 1
    FromZero,      ///< decimal, counted from 0
    LetterAIsZero  ///< `a` for 0, any other character for 1
};

struct PortForm {
    const char* mark;
    bool anywhere;  ///< the mark counts anywhere in the name, case and all; else only in front, in any case
    const char* genericName;
    Numbering numbering;
};

// The first form that fits decides, so a longer mark stands before its own beginning.
constexpr PortForm portForms[] = {
    {"COM", false, "COM", Numbering::FromOne},      {"USB2", false, "USB2", Numbering::FromOne},
    {"USB", false, "USB", Numbering::FromOne},      {"ttyS", true, "COM", Numbering::FromOne},
    {"tty", true, "COM", Numbering::LetterAIsZero}, {"parport", true, "LPT", Numbering::FromZero},
    {"LPT", false, "LPT", Numbering::FromOne},      {"SVF", false, "SVF", Numbering::None},
    {"STA", false, "STAPL", Numbering::None},
};

struct PortMatch {
    const PortForm* form;  ///< null where the name is of no form
    const char* behindMark;
};

PortMatch matchPort(const char* name, int line = __builtin_LINE()) {
    for (const PortForm& form : portForms) {
        const std::size_t length = HkStr::Len(form.mark);
        const bool inFront = HkStr::INCompare(name, form.mark, length) == 0;
        const char* const place = form.anywhere ? HkStr::FindString(name, form.mark) : inFront ? name : nullptr;
        if (place != nullptr) {
            return {&form, place + length};
        }
    }
    cableInfoOrigin.report(line).issueInfo("Invalid Display Port Name %s.\n", name != nullptr ? name : "");
    return {nullptr, nullptr};
}

int oneLess(int number) {
    return number > std::numeric_limits<int>::min() ? number - 1 : number;
}

bool isRemovedSpace(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

}  // namespace

const char* CableInfo::getSpeedString(int speed) {
    const Speed* const found = findSpeed(speed);
    return found != nullptr ? found->digits : nullptr;
}

const char* CableInfo::getDisplaySpeedString(int speed) {
    const Speed* const found = findSpeed(speed);
    return found != nullptr ? found->display : nullptr;
}

int CableInfo::getSpeedNumber(const char* text) {
    for (const Speed& speed : speeds) {
        if (HkStr::ICompare(text, speed.digits) == 0 || HkStr::ICompare(text, speed.display) == 0) {
            return speed.hertz;
        }
    }
    cableInfoOrigin.report().issueStatus("Invalid input speed string %s.\n", text != nullptr ? text : "");
    return -1;
}

char* CableInfo::removeSpace(char* text) {
    if (text == nullptr) {
        return nullptr;
    }
    char* end = text;
    for (const char* next = text; *next != '\0'; ++next) {
        if (!isRemovedSpace(*next)) {
            *end++ = *next;
        }
    }
    *end = '\0';
    return text;
}

const char* CableInfo::getCableNameWithoutSpace(const char* text) {
    return removeSpace(const_cast<char*>(text));
}

const char* CableInfo::getPortGenericName(const char* name) {
    const PortMatch match = matchPort(name);
    return match.form != nullptr ? match.form->genericName : nullptr;
}

int CableInfo::getPortNumber(const char* name) {
    const PortMatch match = matchPort(name);
    switch (match.form != nullptr ? match.form->numbering : Numbering::None) {
        case Numbering::FromOne:
            return oneLess(HkStr::AToI(match.behindMark));
        case Numbering::FromZero:
            return HkStr::AToI(match.behindMark);
        case Numbering::LetterAIsZero:
            return *match.behindMark == 'a' ? 0 : 1;
        case Numbering::None:
            break;
    }
    return -1;
}
