#include <gmock/gmock.h>

#include <cstdlib>
#include <sstream>

#include "DataFileModel.h"
#include "KeyedFiles.h"
#include "MessageRecorder.h"
#include "deviceprofile/SectionReader.h"

namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using testing::StartsWith;

const char* valueOf(ProfileKeyTable& table, const char* key) {
    return table.getstringbykey(key, nullptr, 0, nullptr, 0);
}

/// What a file gives: the keys of its sections as the table finds them, then the messages about its section "base".
std::string dump(const fs::path& path) {
    std::ostringstream out;
    MessageRecorder messages;
    DeviceProfile::FileText text;
    EXPECT_EQ(DeviceProfile::readFile(path, text), nullptr);
    for (const std::string_view name : DeviceProfile::listSections(text)) {
        const std::string section(name);
        out << "[" << section << "]\n";
        const auto table = openTable(path.u8string(), section.c_str());
        for (const auto& [key, expected] : modelSection(bytesOf(path), section)) {
            const char* const value = valueOf(*table, key.c_str());
            out << key << " = \"" << (value != nullptr ? value : "(absent)") << "\"\n";
        }
    }
    messages.clear();
    openTable(path.u8string());
    for (const std::string& message : messages.info()) {
        out << message.substr(std::min(message.find(path.filename().u8string()), message.size()));
    }
    return out.str();
}

/// The odd files of the test data, each beside the dump that it must give.
class OddFile : public testing::TestWithParam<const char*> {};

TEST_P(OddFile, GivesItsDump) {
    const fs::path file = fs::u8path(TEST_DATA_DIR) / (std::string(GetParam()) + ".acd");
    EXPECT_EQ(dump(file), bytesOf(fs::path(file).replace_extension(".dump")));
}

INSTANTIATE_TEST_SUITE_P(DataFile, OddFile,
                         testing::Values("odd_lines", "crlf_bom", "zero_bytes", "cut_off", "endless_comment"),
                         [](const auto& name) { return std::string(name.param); });

using DataFile = KeyedFiles;

TEST_F(DataFile, EveryPrefixReadsAsTheModelDoes) {
    const MessageRecorder messages;
    for (const char* const name : {"odd_lines", "crlf_bom", "zero_bytes", "cut_off"}) {
        const std::string whole = bytesOf(fs::u8path(TEST_DATA_DIR) / (std::string(name) + ".acd"));
        for (std::size_t size = 0; size <= whole.size(); ++size) {
            const std::string bytes = whole.substr(0, size);
            writeFile(m_directory / "cut.acd", bytes);
            const auto table = openTable("cut.acd");
            for (const auto& [key, value] : modelSection(bytes, "base")) {
                ASSERT_STREQ(valueOf(*table, key.c_str()), value.c_str()) << name << " cut at " << size << ", " << key;
            }
        }
    }
}

TEST_F(DataFile, WithoutAReadableFileTheTableIsEmptyAndOneMessageTellsWhy) {
    fs::create_directory(m_directory / "directory.acd");
    writeFile(m_directory / "binary.acd", "[base]\nA = 1\n" + std::string(5000, '\x01'));
    struct Case {
        const char* file;
        const char* reason;
    };
    const Case cases[] = {{"absent.acd", "cannot be read"},
                          {"directory.acd", "is a directory"},
                          {"binary.acd", "is binary"},
                          {"", "cannot be read"}};
    for (const Case& row : cases) {
        MessageRecorder messages;
        const auto table = openTable(row.file);
        EXPECT_EQ(valueOf(*table, "A"), nullptr);
        EXPECT_EQ(table->getstringbykey("A", ":", 0, ",", 0), nullptr);
        EXPECT_EQ(table->GetInt32ByKey("A", nullptr, 0, nullptr, 0), 0);
        EXPECT_THAT(messages.info(),
                    ElementsAre(AllOf(HasSubstr(row.file), HasSubstr(row.reason), HasSubstr(m_directory.u8string()))))
            << row.file;
    }
}

TEST_F(DataFile, ADeviceIsRefusedAndNotWaitedFor) {
    const MessageRecorder messages;
    for (const char* const device : {"/dev/zero", "/dev/null"}) {
        if (fs::exists(device)) {
            openTable(device);
            EXPECT_THAT(messages.info().back(), HasSubstr("is no plain file"));
        }
    }
}

TEST_F(DataFile, LongLinesAndAnEmptyFileAreRead) {
    constexpr std::size_t size = std::size_t{4} << 20;
    const std::string noise(size, 'x');
    writeFile(m_directory / "long.acd", "#" + noise + "\n" + noise + "\n[base]\nLONG = " + noise + "\nLAST = 1");
    writeFile(m_directory / "empty.acd", "");
    MessageRecorder messages;
    const auto table = openTable("long.acd");
    EXPECT_STREQ(valueOf(*table, "LONG"), noise.c_str());
    EXPECT_STREQ(valueOf(*table, "LAST"), "1");
    EXPECT_THAT(messages.info(),
                ElementsAre(AllOf(HasSubstr("long.acd:2: "), EndsWith("xxx...\"\n"), SizeIs(testing::Lt(300U)))));
    messages.clear();
    EXPECT_EQ(valueOf(*openTable("empty.acd"), "LONG"), nullptr);
    EXPECT_THAT(messages.info(), IsEmpty());
}

TEST_F(DataFile, MessagesAboutOneFileAreBounded) {
    std::string bytes = "[base]\n";
    for (int i = 0; i < 150; ++i) {
        bytes += "x\n";
    }
    writeFile(m_directory / "faults.acd", bytes + "GOOD = 1\n");
    const MessageRecorder messages;
    EXPECT_STREQ(valueOf(*openTable("faults.acd"), "GOOD"), "1");
    EXPECT_THAT(messages.info(), SizeIs(101));
    EXPECT_THAT(messages.info().back(), HasSubstr("50 more messages are left out"));
}

void setVariable(const std::string& value) {
#ifdef _WIN32
    _putenv_s("TESSAL_DATA_PATH", value.c_str());
#else
    setenv("TESSAL_DATA_PATH", value.c_str(), 1);
#endif
}

TEST_F(DataFile, TheFirstSourceOfDirectoriesThatIsSetIsTheOnlyOne) {
    const char separator = fs::path::preferred_separator == '/' ? ':' : ';';
    const fs::path first = m_directory / "first";
    const fs::path second = m_directory / "second";
    fs::create_directory(first);
    fs::create_directory(second);
    writeFile(first / "one.acd", "[base]\nA = first\n");
    writeFile(second / "one.acd", "[base]\nA = second\n");
    writeFile(second / "two.acd", "[base]\nA = two\n");
    const MessageRecorder messages;
    setVariable(second.u8string());
    DeviceProfile::setDataPath((first.u8string() + separator).c_str());
    EXPECT_STREQ(valueOf(*openTable("one.acd"), "A"), "first");
    EXPECT_EQ(valueOf(*openTable("two.acd"), "A"), nullptr);
    DeviceProfile::setDataPath((first.u8string() + separator + separator + second.u8string()).c_str());
    EXPECT_STREQ(valueOf(*openTable("one.acd"), "A"), "first");
    EXPECT_STREQ(valueOf(*openTable("two.acd"), "A"), "two");
    DeviceProfile::setDataPath(nullptr);
    EXPECT_STREQ(valueOf(*openTable("one.acd"), "A"), "second");
    setVariable("");
    openTable("one.acd");
    EXPECT_THAT(messages.info().back(), HasSubstr("given by the installation"));
}

TEST_F(DataFile, NamesOutsideAsciiAreFound) {
    const fs::path directory = m_directory / fs::u8path("d\xC3\xA4ten");
    fs::create_directory(directory);
    writeFile(directory / fs::u8path("\xE8\xA3\x85\xE7\xBD\xAE.acd"), "[ger\xC3\xA4t]\nA = 1\n");
    DeviceProfile::setDataPath(directory.u8string().c_str());
    EXPECT_STREQ(valueOf(*openTable("\xE8\xA3\x85\xE7\xBD\xAE.acd", "ger\xC3\xA4t"), "A"), "1");
}

}  // namespace
