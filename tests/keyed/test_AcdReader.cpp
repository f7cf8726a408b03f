#include <gmock/gmock.h>

#include <climits>

#include "AcdReader.h"
#include "KeyedFiles.h"

namespace {

using testing::ElementsAre;
using testing::SizeIs;

static_assert(sizeof(AcdReader) == 2 * sizeof(void*));

class Reader : public KeyedFiles {
protected:
    Reader() {
        m_directory.write("tessal.acd",
                          "[base]\nNAME = base\nYES = TRUE\nLOWER = true\nLONGER = TRUE FALSE\nNUMBER = 4096\n"
                          "LIST = 16,-32, 48,x\nONE = 7\nNOTHING =\n[xz7s10]\nNAME = device\n");
    }
};

TEST_F(Reader, AnswersFromTheSectionOfItsDevice) {
    AcdReader reader;
    EXPECT_STREQ(reader.getProfile(), "base");
    EXPECT_STREQ(reader.getStringByKey("NAME"), "base");
    EXPECT_STREQ(reader.getDevkey()->getstringbykey("LIST", ",", 2, nullptr, 0), " 48");
    reader.setDevice("xz7s10");
    EXPECT_STREQ(reader.getStringByKey("NAME"), "device");
    EXPECT_EQ(reader.getStringByKey("YES"), nullptr) << "sections do not inherit";
    reader.setDevice(reader.getProfile());
    EXPECT_STREQ(reader.getProfile(), "xz7s10");
    reader.setDevice(nullptr);
    EXPECT_STREQ(reader.getStringByKey("NAME"), "base");
    EXPECT_STREQ(AcdReader("unknown").getProfile(), "unknown");
    EXPECT_EQ(AcdReader("unknown").getStringByKey("NAME"), nullptr);
}

TEST_F(Reader, ConvertsValues) {
    const AcdReader reader("base");
    EXPECT_EQ(reader.getLongByKey("NUMBER"), 4096);
    EXPECT_TRUE(reader.getLongByKey("NAME") == 0 && reader.getLongByKey("NONE") == 0);
    EXPECT_TRUE(reader.isKey("YES"));
    EXPECT_FALSE(reader.isKey("LOWER") || reader.isKey("LONGER") || reader.isKey("NONE") || reader.isKey("NOTHING"));
    EXPECT_THAT(reader.getLongVectorByKey("LIST"), ElementsAre(16, -32, 48, 0));
    EXPECT_THAT(reader.getLongVectorByKey("ONE"), ElementsAre(7));
    EXPECT_TRUE(reader.getLongVectorByKey("NONE").empty() && reader.getStringVectorByKey("NONE").empty());
    EXPECT_THAT(reader.getStringVectorByKey("LIST"), ElementsAre("16", "-32", " 48", "x"));
    EXPECT_THAT(reader.getStringVectorByKey("NOTHING"), ElementsAre(""));
    EXPECT_EQ(reader.getStringByKey(nullptr), nullptr);
}

TEST_F(Reader, ListsEndWithTheHighestIndex) {
    std::string list = "[base]\nLIST = 0";
    for (int i = 1; i < 40000; ++i) {
        list += "," + std::to_string(i);
    }
    m_directory.write("tessal.acd", list);
    const AcdReader reader;
    EXPECT_THAT(reader.getLongVectorByKey("LIST"), SizeIs(32768));
    EXPECT_STREQ(openTable("tessal.acd")->getstringbykey("LIST", ",", SHRT_MAX, nullptr, 0), "32767");
}

}  // namespace
