#include "CableInfo.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <iterator>
#include <limits>
#include <sstream>
#include <string>
#include <tuple>
#include <vector>

#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::StrCaseEq;

TEST(CableInfo, EverySpeedConvertsInAllDirections) {
    const int speeds[] = {0,      9600,    19200,   38400,   57600,   187000,  200000,  300000,   375000,   625000,
                          750000, 1250000, 1500000, 2500000, 3000000, 5000000, 6000000, 10000000, 12000000, 24000000};
    const char* const displays[] = {"0",       "9600",    "19200",   "38400",   "57600",    "187 khz", "200 KHZ",
                                    "300 KHz", "375 KHz", "625 KHz", "750 KHz", "1.25 mhz", "1.5 MHz", "2.5 MHz",
                                    "3 MHz",   "5 MHz",   "6 MHz",   "10 MHz",  "12 MHz",   "24 MHz"};
    const MessageRecorder messages;
    for (std::size_t i = 0; i < std::size(speeds); ++i) {
        const std::string plain = std::to_string(speeds[i]);
        EXPECT_EQ(CableInfo::getSpeedNumber(displays[i]), speeds[i]);
        EXPECT_EQ(CableInfo::getSpeedNumber(plain.c_str()), speeds[i]);
        EXPECT_EQ(CableInfo::getSpeedString(speeds[i]), plain);
        EXPECT_THAT(CableInfo::getDisplaySpeedString(speeds[i]), StrCaseEq(displays[i]));
    }
    EXPECT_THAT(messages.all(), IsEmpty());
}

TEST(CableInfo, SpeedsOutsideTheTableAreReportedAndShownAsUnknown) {
    MessageRecorder messages;
    CableInfo cable;
    cable.setCableName("my cable");
    cable.setPortName("LPT");
    cable.setPortSpeed(1234);
    cable.dump();
    EXPECT_THAT(messages.info(), ElementsAre("Invalid speed 1234.\n", "Invalid speed 1234.\n"));
    EXPECT_THAT(
        messages.status(),
        ElementsAre(std::string(42, '-') + "\n", "Cable Name: my cable\n", "Port Name: LPT\n", "Port Number: -1\n",
                    "Port Speed: 1234\n", "Display Cable Name: my cable\n", "Cable Name w/o space: mycable\n",
                    "Display Port Speed: unknown\n", "Port Speed string: unknown\n", "Display Port Name: LPT\n"));
    messages.clear();
    for (const char* text : {"5MHz", "", static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(CableInfo::getSpeedNumber(text), -1);
    }
    EXPECT_THAT(messages.status(), ElementsAre("Invalid input speed string 5MHz.\n", "Invalid input speed string .\n",
                                               "Invalid input speed string .\n"));
}

TEST(CableInfo, PortNamesGiveGenericNameAndNumber) {
    const std::tuple<const char*, const char*, int> cases[] = {
        {"COM3", "COM", 2},     {"com", "COM", -1},     {"usb21", "USB2", 0},
        {"USB1", "USB", 0},     {"ttyS0", "COM", -1},   {"/dev/ttyS1", "COM", 0},
        {"ttya", "COM", 0},     {"ttyb", "COM", 1},     {"tty", "COM", 1},
        {"parport0", "LPT", 0}, {"LPT1", "LPT", 0},     {"/dev/parport12", "LPT", 12},
        {"SVF", "SVF", -1},     {"STAX", "STAPL", -1},  {"ST", nullptr, -1},
        {nullptr, nullptr, -1}, {"TTYS1", nullptr, -1}, {"COM-99999999999", "COM", std::numeric_limits<int>::min()}};
    for (const auto& [name, generic, number] : cases) {
        const std::string text = name != nullptr ? name : "";
        SCOPED_TRACE(text);
        const MessageRecorder messages;
        EXPECT_STREQ(CableInfo::getPortGenericName(name), generic);
        EXPECT_EQ(CableInfo::getPortNumber(name), number);
        EXPECT_EQ(messages.info(),
                  std::vector<std::string>(generic != nullptr ? 0 : 2, "Invalid Display Port Name " + text + ".\n"));
    }
}

TEST(CableInfo, TypeAndDisplayNameFollowThePortNameThatWasSetLast) {
    const std::tuple<const char*, unsigned int, int, CableInfo::CableType, const char*> cases[] = {
        {"usb2", 0, 0, CableInfo::CABLE_USB2, "USB21"},
        {"USB2", 3, -1, CableInfo::CABLE_USB2, "USB2"},
        {"USB2", 4, 0, CableInfo::CABLE_USB2_FLAG4, "NULL"},
        {"USB2", 12, 0, CableInfo::CABLE_USB2_FLAG8, "NULL"},
        {"Usb", 4, 9, CableInfo::CABLE_USB, "USB10"},
        {"COM", 0, 0, CableInfo::CABLE_COM, "COM1"},
        {"NULL", 0, 1, CableInfo::CABLE_NULL, "NULL"},
        {"design.zsvf", 0, -1, CableInfo::CABLE_SVF, "SVF"},
        {"d.stapl", 0, 1, CableInfo::CABLE_STAPL, "STAPL"},
        {"design.txt", 0, 1, CableInfo::CABLE_NONE, "NULL"},
        {"LPT1", 0, 1, CableInfo::CABLE_NONE, "NULL"},
        {"a.svfsvfsvf", 0, 1, CableInfo::CABLE_NONE, "NULL"},
        {"LPT", 0, std::numeric_limits<int>::max(), CableInfo::CABLE_LPT, "LPT2147483648"}};
    for (const auto& [port, flags, number, type, display] : cases) {
        SCOPED_TRACE(port);
        CableInfo cable;
        EXPECT_STREQ(cable.getDisplayPortName(), "NULL");
        cable.setPortName("LPT");
        EXPECT_EQ(cable.getCableType(), CableInfo::CABLE_LPT);
        cable.setPortName(port);
        cable.setFlags(flags);
        cable.setPortNumber(number);
        EXPECT_EQ(cable.getCableType(), type);
        EXPECT_STREQ(cable.getDisplayPortName(), display);
        cable.setFlags(~flags);
        EXPECT_EQ(CableInfo(cable).getCableType(), type) << "flags do not change a type once decided";
    }
}

TEST(CableInfo, DisplayNamesOfDeviceNodesFollowAStreamedPortName) {
    const std::tuple<const char*, const char*, const char*> cases[] = {
        {"COM", "1 ", "COM2"},           {"COM", "5\nttyS1\n1\n", "ttyS1"}, {"COM", "4\nttya\n0\n", "ttya"},
        {"COM", "4\nttya\n7\n", "ttyb"}, {"COM", "5\nother\n0\n", "COM2"},  {"LPT", "8\nparport0\n0\n", "parport0"},
        {"LPT", "5\nother\n0\n", "LPT1"}};
    for (const auto& [decided, streamed, display] : cases) {
        SCOPED_TRACE(streamed);
        CableInfo cable;
        cable.setPortName(decided);
        cable.setPortNumber(1);
        cable.getDisplayPortName();
        std::istringstream in(streamed);
        cable.readStream(in);
        EXPECT_STREQ(cable.getDisplayPortName(), display);
    }
}

TEST(CableInfo, WhiteSpaceIsRemovedInPlaceAndTheNameIsKept) {
    char text[] = " a\tb\r\nc\vd ";
    EXPECT_EQ(CableInfo::getCableNameWithoutSpace(text), text);
    EXPECT_STREQ(text, "abc\vd");
    EXPECT_EQ(CableInfo::removeSpace(nullptr), nullptr);
    CableInfo cable;
    cable.setCableName(nullptr);
    EXPECT_STREQ(cable.getCableName(), "");
    cable.setCableName("my cable");
    EXPECT_STREQ(cable.getCableNameWithoutSpace(), "mycable");
    cable.setCableName(" ");
    EXPECT_STREQ(cable.getCableNameWithoutSpace(), "");
}

}  // namespace
