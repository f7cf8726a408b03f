// The text stream form: Streamable, NetString and the stream side of CableInfo.

#include <gtest/gtest.h>

#include <iomanip>
#include <limits>
#include <locale>
#include <sstream>
#include <string>

#include "CableInfo.h"
#include "NetString.h"

namespace {

struct BareRecord : Streamable {
    void readStream(std::istream& in) override { Streamable::readStream(in); }
    void writeStream(std::ostream& out) override { Streamable::writeStream(out); }
};

std::string written(Streamable& record) {
    std::ostringstream out;
    record.writeStream(out);
    return out.str();
}

CableInfo sampleCable() {
    CableInfo cable;
    cable.setPortName("USB2");
    cable.setPortNumber(0);
    cable.setPortSpeed(6000000);
    cable.setCableName("abc");
    return cable;
}

/// A locale that groups digits, as those of many countries do.
struct Grouping : std::numpunct<char> {
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

TEST(Streamable, TheIdTravelsAsADecimalLine) {
    struct Case {
        const char* text;
        int id;
        bool good;
    };
    constexpr int most = std::numeric_limits<int>::max();
    constexpr int least = std::numeric_limits<int>::min();
    const Case cases[] = {{"7\n", 7, true},
                          {" \n\t-12 ", -12, true},
                          {"+5x", 5, true},
                          {"", 0, false},
                          {"   ", 0, false},
                          {"x", 0, false},
                          {"-", 0, false},
                          {"2147483647 ", most, true},
                          {"2147483648 ", most, false},
                          {"-2147483648 ", least, true},
                          {"-99999999999999999999999 ", least, false}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        BareRecord record;
        std::istringstream in(c.text);
        record.readStream(in);
        EXPECT_EQ(record.getId(), c.id);
        EXPECT_EQ(!in.fail(), c.good);
        int standard = 0;
        std::istringstream again(c.text);
        again >> standard;
        EXPECT_EQ(record.getId(), standard);
        EXPECT_EQ(in.rdstate(), again.rdstate());
    }
    BareRecord record;
    std::istringstream in("7");
    record.readStream(in);
    EXPECT_EQ(written(record), "7\n");
}

TEST(NetString, StreamsOneWordAndNeverPassesItsLength) {
    struct Case {
        const char* text;
        const char* read;  ///< null: the former text stays
        const char* rest;
    };
    const Case cases[] = {{"3\nabc\n9", "abc", "\n9"},
                          {"0\n\n9", "", "\n\n9"},
                          {"3\nab cd\n", "ab", " cd\n"},
                          {"2\nabc\n", "ab", "c\n"},
                          {"2000000000\nabc", "abc", ""},
                          {"-1\nabc", nullptr, nullptr},
                          {"99999999999\nabc", nullptr, nullptr},
                          {"3\n", nullptr, nullptr},
                          {"x\nabc", nullptr, nullptr},
                          {"", nullptr, nullptr}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.text);
        NetString field;
        field.setString("former");
        std::istringstream in(c.text);
        field.readStream(in);
        EXPECT_STREQ(field.getString(), c.read != nullptr ? c.read : "former");
        EXPECT_EQ(in.fail(), c.read == nullptr);
        if (c.rest != nullptr) {
            in.clear();
            EXPECT_EQ(std::string(std::istreambuf_iterator<char>(in), {}), c.rest);
        }
    }
}

TEST(NetString, TextsAreOwnedAndMissingOnesAreHarmless) {
    NetString none;
    EXPECT_EQ(none.getString(), nullptr);
    EXPECT_EQ(written(none), "0\n\n");
    NetString assigned;
    assigned = none;
    EXPECT_STREQ(assigned.getString(), "NetString");
    const NetString copy(assigned);
    EXPECT_STREQ(copy.getString(), "NetString");
    EXPECT_NE(copy.getString(), assigned.getString());
    EXPECT_STREQ(NetString(none).getString(), "");
    assigned.setString(assigned.getString() + 3);
    EXPECT_STREQ(assigned.getString(), "String");
    assigned = *&assigned;
    EXPECT_STREQ(assigned.getString(), "String");
    assigned.setString(nullptr);
    EXPECT_STREQ(assigned.getString(), "");
}

TEST(CableInfoStream, IsSixLinesWhateverTheStreamWasSetTo) {
    CableInfo cable = sampleCable();
    std::ostringstream out;
    out.imbue(std::locale(std::locale::classic(), new Grouping));
    out << std::hex << std::showbase << std::setw(20);
    cable.writeStream(out);
    EXPECT_EQ(out.str(), "4\nUSB2\n0\n6000000\n3\nabc\n");

    std::istringstream in(out.str());
    in.imbue(out.getloc());
    in >> std::hex >> std::noskipws;
    CableInfo back;
    back.setESN("kept");
    back.readStream(in);
    EXPECT_EQ(written(back), out.str());
    EXPECT_STREQ(back.getESN(), "kept");
}

TEST(CableInfoStream, ACutRecordKeepsEveryFieldThatIsNotThere) {
    CableInfo cable = sampleCable();
    const std::string whole = written(cable);
    for (std::size_t length = 0; length + 2 < whole.size(); ++length) {
        SCOPED_TRACE(whole.substr(0, length));
        CableInfo back;
        back.setPortName("LPT");
        back.setCableName("former");
        std::istringstream in(whole.substr(0, length));
        back.readStream(in);
        const std::string name = back.getCableName();
        EXPECT_TRUE(name == "former" || std::string("abc").compare(0, name.size(), name) == 0);
        EXPECT_TRUE(in.eof());
        std::istringstream again(written(back));
        CableInfo third;
        third.readStream(again);
        EXPECT_FALSE(again.fail());
    }
}

TEST(CableInfoStream, ReadingLeavesTypeAndCachesInForce) {
    CableInfo cable = sampleCable();
    EXPECT_EQ(cable.getCableType(), CableInfo::CABLE_USB2);
    EXPECT_STREQ(cable.getCableNameWithoutSpace(), "abc");
    std::istringstream in("3\nLPT\n1\n0\n3\nxyz\n");
    cable.readStream(in);
    EXPECT_EQ(cable.getCableType(), CableInfo::CABLE_USB2);
    EXPECT_STREQ(cable.getCableNameWithoutSpace(), "abc");
    EXPECT_STREQ(cable.getCableName(), "xyz");
}

}  // namespace
