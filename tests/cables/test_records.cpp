// The text stream form: Streamable, NetString and the stream side of CableInfo.

#include <gtest/gtest.h>

#include <iomanip>
#include <locale>
#include <sstream>
#include <string>
#include <tuple>

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
    for (const char* const text : {"7\n", " \n\t-12 ", "+5x", "", "   ", "x", "-", "2147483647 ", "2147483648 ",
                                   "-2147483648 ", "-99999999999999999999999 "}) {
        SCOPED_TRACE(text);
        BareRecord record;
        std::istringstream in(text);
        record.readStream(in);
        int standard = 0;
        std::istringstream again(text);
        again >> standard;
        EXPECT_EQ(record.getId(), standard);
        EXPECT_EQ(in.rdstate(), again.rdstate());
        EXPECT_EQ(written(record), std::to_string(standard) + "\n");
    }
}

TEST(NetString, StreamsOneWordAndNeverPassesItsLength) {
    const std::tuple<const char*, const char*, const char*> cases[] = {// null: the former text stays
                                                                       {"3\nabc\n9", "abc", "\n9"},
                                                                       {"0\n\n9", "", "\n\n9"},
                                                                       {"3\nab cd\n", "ab", " cd\n"},
                                                                       {"2\nabc\n", "ab", "c\n"},
                                                                       {"2000000000\nabc", "abc", ""},
                                                                       {"-1\nabc", nullptr, "\nabc"},
                                                                       {"99999999999\nabc", nullptr, "\nabc"},
                                                                       {"3\n", nullptr, ""},
                                                                       {"x\nabc", nullptr, "x\nabc"}};
    for (const auto& [text, read, rest] : cases) {
        SCOPED_TRACE(text);
        NetString field;
        field.setString("former");
        std::istringstream in(text);
        field.readStream(in);
        EXPECT_STREQ(field.getString(), read != nullptr ? read : "former");
        EXPECT_EQ(in.fail(), read == nullptr);
        in.clear();
        EXPECT_EQ(std::string(std::istreambuf_iterator<char>(in), {}), rest);
    }
}

TEST(NetString, TextsAreOwnedAndMissingOnesAreHarmless) {
    NetString none;
    EXPECT_EQ(none.getString(), nullptr);
    EXPECT_EQ(written(none), "0\n\n");
    NetString assigned;
    assigned = none;
    EXPECT_STREQ(NetString(assigned).getString(), "NetString");
    EXPECT_STREQ(NetString(none).getString(), "");
    assigned.setString(assigned.getString() + 3);
    assigned = *&assigned;
    EXPECT_STREQ(assigned.getString(), "String");
    assigned.setString(nullptr);
    EXPECT_STREQ(assigned.getString(), "");
}

TEST(CableInfoStream, IsSixLinesWhateverTheStreamWasSetTo) {
    CableInfo fresh;
    EXPECT_EQ(written(fresh), "0\n\n-1\n0\n0\n\n");
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
