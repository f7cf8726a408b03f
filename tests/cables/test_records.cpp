// The text stream form: Streamable, NetString and the stream side of CableInfo.

#include <gtest/gtest.h>

#include <iomanip>
#include <locale>
#include <sstream>
#include <string>
#include <tuple>

#include "CableInfo.h"
#include "NetString.h"
#include "TemporaryDirectory.h"

namespace {

struct BareRecord : Streamable {
    void readStream(std::istream& in) override { Streamable::readStream(in); }
    void writeStream(std::ostream& out) override { Streamable::writeStream(out); }
};

/// Hands the text to @p check in a stream whose buffer holds all of it ready, and in one that holds one character.
template <class Check>
void throughBothBuffers(const std::string& text, Check check) {
    const TemporaryDirectory directory;
    std::istringstream whole(text);
    std::ifstream trickle;
    trickle.rdbuf()->pubsetbuf(nullptr, 0);
    trickle.open(std::filesystem::u8path(directory.write("record", text)), std::ios::binary);
    for (std::istream* const in : {static_cast<std::istream*>(&whole), static_cast<std::istream*>(&trickle)}) {
        SCOPED_TRACE(text + (in == &whole ? "whole" : "in trickles"));
        check(*in);
    }
}

std::string rest(std::istream& in) {
    in.clear();
    return {std::istreambuf_iterator<char>(in), {}};
}

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
    for (const char* const text :
         {"7\n", " \n\t-12 ", "+5x", "", "   ", "x", "-", "2147483647 ", "2147483648 ", "-2147483648 ",
          "-99999999999999999999999 ", "000000000000007 ", "999999999", "9-"}) {
        throughBothBuffers(text, [text](std::istream& in) {
            BareRecord record;
            record.readStream(in);
            int standard = 0;
            std::istringstream again(text);
            again >> standard;
            EXPECT_EQ(record.getId(), standard);
            EXPECT_EQ(in.rdstate(), again.rdstate());
            EXPECT_EQ(rest(in), rest(again));
            EXPECT_EQ(written(record), std::to_string(standard) + "\n");
        });
    }
}

TEST(NetString, StreamsOneWordAndNeverPassesItsLength) {
    const std::tuple<const char*, const char*, const char*> cases[] = {{"3\nabc\n9", "abc", "\n9"},
                                                                       {"0\n\n9", "", "\n\n9"},
                                                                       {"3\nab cd\n", "ab", " cd\n"},
                                                                       {"2\nabc\n", "ab", "c\n"},
                                                                       {"2000000000\nabc", "abc", ""},
                                                                       {"-1\nabc", nullptr, "\nabc"},
                                                                       {"99999999999\nabc", nullptr, "\nabc"},
                                                                       {"3\n", nullptr, ""},
                                                                       {"x\nabc", nullptr, "x\nabc"}};
    for (const auto& row : cases) {
        throughBothBuffers(std::get<0>(row), [&row](std::istream& in) {
            const auto& [text, read, left] = row;
            NetString field;
            field.setString("former");
            field.readStream(in);
            EXPECT_STREQ(field.getString(), read != nullptr ? read : "former") << "null: the former text stays";
            EXPECT_EQ(in.fail(), read == nullptr);
            EXPECT_EQ(rest(in), left);
        });
    }
}

TEST(NetString, TextsOfAnyLengthPassWhole) {
    for (const std::size_t length : {200U, 255U, 256U, 1000U}) {
        const std::string text(length, 'n');
        const std::string form = std::to_string(length) + "\n" + text + "\n";
        throughBothBuffers(form, [&](std::istream& in) {
            NetString field;
            field.readStream(in);
            EXPECT_EQ(field.getString(), text);
            EXPECT_EQ(written(field), form);
        });
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
    back.setCableName("x y");
    EXPECT_STREQ(back.getCableNameWithoutSpace(), "xy");
    back.readStream(in);
    EXPECT_EQ(written(back), out.str());
    EXPECT_STREQ(back.getESN(), "kept");
    EXPECT_STREQ(back.getCableNameWithoutSpace(), "xy") << "what was asked for stays in force";
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

}  // namespace
