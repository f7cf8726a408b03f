#include <gmock/gmock.h>

#include <type_traits>

#include "AcdReader.h"
#include "KeyedFiles.h"
#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

static_assert(!std::is_copy_constructible_v<AcdReader> && !std::is_copy_assignable_v<AcdReader>);
static_assert(sizeof(AcdReader) == 2 * sizeof(void*));

class Reader : public KeyedFiles {
protected:
    void SetUp() override {
        KeyedFiles::SetUp();
        writeFile(m_directory / "tessal.acd",
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
    EXPECT_STREQ(reader.getStringByKey("NAME"), "device");
    reader.setDevice(nullptr);
    EXPECT_STREQ(reader.getProfile(), "base");
    EXPECT_STREQ(reader.getStringByKey("NAME"), "base");
    EXPECT_STREQ(AcdReader("unknown").getProfile(), "unknown");
    EXPECT_EQ(AcdReader("unknown").getStringByKey("NAME"), nullptr);
}

TEST_F(Reader, ConvertsValues) {
    const AcdReader reader("base");
    EXPECT_EQ(reader.getLongByKey("NUMBER"), 4096);
    EXPECT_EQ(reader.getLongByKey("NAME"), 0);
    EXPECT_EQ(reader.getLongByKey("NONE"), 0);
    EXPECT_TRUE(reader.isKey("YES"));
    for (const char* const key : {"LOWER", "LONGER", "NONE", "NOTHING"}) {
        EXPECT_FALSE(reader.isKey(key)) << key;
    }
    EXPECT_THAT(reader.getLongVectorByKey("LIST"), ElementsAre(16, -32, 48, 0));
    EXPECT_THAT(reader.getLongVectorByKey("ONE"), ElementsAre(7));
    EXPECT_THAT(reader.getLongVectorByKey("NONE"), IsEmpty());
    EXPECT_THAT(reader.getStringVectorByKey("LIST"), ElementsAre("16", "-32", " 48", "x"));
    EXPECT_THAT(reader.getStringVectorByKey("NOTHING"), ElementsAre(""));
    EXPECT_THAT(reader.getStringVectorByKey("NONE"), IsEmpty());
    EXPECT_EQ(reader.getStringByKey(nullptr), nullptr);
}

TEST_F(Reader, WithoutADataFileFindsNothingAndSaysSoOnce) {
    fs::remove(m_directory / "tessal.acd");
    const MessageRecorder messages;
    const AcdReader reader;
    EXPECT_EQ(reader.getStringByKey("NAME"), nullptr);
    EXPECT_THAT(reader.getLongVectorByKey("LIST"), IsEmpty());
    EXPECT_THAT(messages.info(), SizeIs(1));
}

TEST_F(Reader, ListsEndWithTheHighestIndex) {
    std::string list = "[base]\nLIST = 0";
    for (int i = 1; i < 40000; ++i) {
        list += "," + std::to_string(i);
    }
    writeFile(m_directory / "tessal.acd", list);
    EXPECT_THAT(AcdReader().getLongVectorByKey("LIST"), SizeIs(32768));
}

}  // namespace
