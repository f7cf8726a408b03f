#include <gmock/gmock.h>

#include <algorithm>
#include <fstream>
#include <random>
#include <regex>
#include <sstream>

#include "DataFileModel.h"
#include "EnvironmentVariable.h"
#include "KeyedFiles.h"
#include "MessageRecorder.h"
#include "deviceprofile/SectionReader.h"

namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::SizeIs;

std::string bytesOf(const fs::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
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

using DataFile = KeyedFiles;

// The odd files of the test data, each beside the dump that it must give.
TEST_F(DataFile, OddFilesGiveTheirDumpsAndEveryPrefixReadsAsTheModelDoes) {
    for (const char* const name : {"odd_lines", "crlf_bom", "zero_bytes", "cut_off", "endless_comment", "empty"}) {
        fs::path file = fs::absolute(fs::u8path(TEST_DATA_DIR)) / name;  // no search below the data path
        const std::string expected = bytesOf(file.replace_extension(".dump"));
        EXPECT_EQ(dump(file.replace_extension(".acd")), expected);
        const MessageRecorder messages;
        const std::string whole = bytesOf(file);
        for (std::size_t size = 0; size <= whole.size(); ++size) {
            const std::string bytes = whole.substr(0, size);
            m_directory.write("cut.acd", bytes);
            const auto table = openTable("cut.acd");
            for (const auto& [key, value] : modelSection(bytes, "base")) {
                ASSERT_STREQ(valueOf(*table, key.c_str()), value.c_str()) << name << " cut at " << size << ", " << key;
            }
        }
    }
}

TEST_F(DataFile, LongValuesOfManyLinesReadAsTheModelDoes) {
    constexpr const char* pieces[] = {"\\\n", "\\\r\n", "x", "  ", "\\x", "\r", "words that fill a block"};
    std::mt19937 random(1);
    for (int round = 0; round < 1000; ++round) {
        std::string bytes = "[base]\nA = \\\n";
        for (auto left = random() % 200; left > 0; --left) {
            bytes += pieces[random() % std::size(pieces)];
        }
        const bool isCutOff = std::regex_search(bytes, std::regex(R"(\\\r?\n?$)"));
        const auto lines = std::count(bytes.begin(), bytes.end(), '\n');
        std::string problem = ":2: the file ends where";
        if (!isCutOff) {
            bytes += round % 2 != 0 ? "\nodd" : "";
            problem = round % 2 != 0 ? ":" + std::to_string(lines + 2) + ": neither" : "";
        }
        m_directory.write("long.acd", bytes);
        const MessageRecorder messages;
        const auto table = openTable("long.acd");
        EXPECT_STREQ(valueOf(*table, "A"), modelSection(bytes, "base")["A"].c_str()) << bytes;
        EXPECT_EQ(messages.info().size(), problem.empty() ? 0U : 1U) << bytes;
        EXPECT_TRUE(problem.empty() || messages.info().at(0).find(problem) != std::string::npos) << bytes;
    }
}

TEST_F(DataFile, WithoutAReadableFileTheTableIsEmptyAndOneMessageTellsWhy) {
    m_directory.make("directory.acd");
    m_directory.write("binary.acd", "[base]\nA = 1\n" + std::string(5000, '\x01'));
    fs::resize_file(m_directory.write("huge.acd", ""), (std::uintmax_t{1} << 30) + 1);
    constexpr std::pair<const char*, const char*> cases[] = {
        {"absent.acd", "cannot be read"}, {"directory.acd", "is a directory"},
        {"binary.acd", "is binary"},      {"huge.acd", "is too large"},
        {"", "cannot be read"},           {"/dev/zero", "is no plain file"},
        {"/dev/null", "is no plain file"}};
    for (const auto& [file, reason] : cases) {
        if (file[0] == '/' && !fs::exists(file)) {
            continue;
        }
        const MessageRecorder messages;
        const auto table = openTable(file);
        EXPECT_EQ(valueOf(*table, "A"), nullptr);
        EXPECT_EQ(table->getstringbykey("A", ":", 0, ",", 0), nullptr);
        EXPECT_EQ(table->GetInt32ByKey("A", nullptr, 0, nullptr, 0), 0);
        ASSERT_THAT(messages.info(), ElementsAre(AllOf(HasSubstr(file), HasSubstr(reason)))) << file;
        EXPECT_THAT(messages.info()[0], HasSubstr(file[0] == '/' ? file : fs::u8path(m_directory.path()).u8string()));
    }
}

TEST_F(DataFile, LongLinesAreReadWhole) {
    const std::string noise(std::size_t{4} << 20, 'x');
    m_directory.write("long.acd", "#" + noise + "\n" + noise + "\n[base]\nLONG = " + noise + "\nLAST = 1");
    const MessageRecorder messages;
    const auto table = openTable("long.acd");
    EXPECT_STREQ(valueOf(*table, "LONG"), noise.c_str());
    EXPECT_STREQ(valueOf(*table, "LAST"), "1");
    EXPECT_THAT(messages.info(),
                ElementsAre(AllOf(HasSubstr("long.acd:2: "), EndsWith("xxx...\"\n"), SizeIs(testing::Lt(300U)))));
}

TEST_F(DataFile, MessagesAboutOneFileAreBounded) {
    std::ostringstream bytes("[base]\n", std::ios::ate);
    std::fill_n(std::ostream_iterator<const char*>(bytes), 150, "x\n");
    m_directory.write("faults.acd", bytes.str() + "GOOD = 1\n");
    const MessageRecorder messages;
    EXPECT_STREQ(valueOf(*openTable("faults.acd"), "GOOD"), "1");
    EXPECT_THAT(messages.info(), SizeIs(101));
    EXPECT_THAT(messages.info().back(), HasSubstr("50 more messages are left out"));
}

TEST_F(DataFile, TheFirstSourceOfDirectoriesThatIsSetIsTheOnlyOne) {
    const std::string separator = fs::path::preferred_separator == '/' ? ":" : ";";
    const std::string first = m_directory.make("first");
    const std::string second = m_directory.make("d\xC3\xA4ten");
    m_directory.write("first/one.acd", "[base]\nA = first\n");
    m_directory.write("d\xC3\xA4ten/one.acd", "[base]\nA = second\n");
    m_directory.write("d\xC3\xA4ten/\xE8\xA3\x85.acd", "[ger\xC3\xA4t]\nA = two\n");
    const auto found = [](const char* file, const char* section) {
        const auto table = openTable(file, section);
        const char* const value = valueOf(*table, "A");
        return std::string(value != nullptr ? value : "none");
    };
    const auto all = [&] { return found("one.acd", "base") + " " + found("\xE8\xA3\x85.acd", "ger\xC3\xA4t"); };
    const MessageRecorder messages;
    EnvironmentVariable variable("TESSAL_DATA_PATH", second.c_str());
    DeviceProfile::setDataPath((first + separator).c_str());
    EXPECT_EQ(all(), "first none");
    DeviceProfile::setDataPath((separator + first + separator + second).c_str());
    EXPECT_EQ(all(), "first two");
    DeviceProfile::setDataPath(nullptr);
    EXPECT_EQ(found("one.acd", "base"), "second");
    variable.set("");
    openTable("one.acd");
    EXPECT_THAT(messages.info().back(), HasSubstr("given by the installation"));
}

}  // namespace
