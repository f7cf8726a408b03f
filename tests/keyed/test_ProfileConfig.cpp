#include <gmock/gmock.h>

#include "KeyedFiles.h"
#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

/// A text that was handed out, released.
std::string taken(char* text) {
    const std::unique_ptr<char[]> owner(text);
    return text != nullptr ? text : "(null)";
}

class Config : public KeyedFiles {
protected:
    Config() {
        m_directory.write("tessal.acd", "[base]\nA = 1\n[xz7s10]\nA = 2\n[xz7s20]\n[base]\n[Brennwick-1]\n");
        m_directory.write("proms.dat", "");
        m_directory.write("guide.txt", "");
    }

    std::string path(const char* name) const { return (fs::u8path(m_directory.path()) / name).u8string(); }

    DeviceProfile::ProfileConfig m_config{"xz7s10", 1, ProfilePartBound};
};

TEST_F(Config, SelectsAndChecksProfiles) {
    const MessageRecorder messages;
    EXPECT_STREQ(m_config.get_profile(), "xz7s10");
    EXPECT_TRUE(m_config.isvalid(1, 1) == 1 && m_config.isunsupported() == 0 && m_config.set_profile("xz9") == 1);
    EXPECT_TRUE(m_config.isvalid(0, 1) == 1 && m_config.isunsupported() == 1 && messages.info().empty());
    EXPECT_EQ(m_config.isvalid(1, 1), 0);
    EXPECT_THAT(messages.info(), ElementsAre(HasSubstr("[xz9]")));
    for (const char* const name : {"", " xz", "xz ", "x]z", "[xz", "x\nz"}) {
        EXPECT_TRUE(m_config.isvalidprofilename(name, 0) == 0 && m_config.set_profile(name) == 0) << name;
    }
    EXPECT_EQ(m_config.set_profile(nullptr), 0);
    EXPECT_STREQ(m_config.get_profile(), "xz9");
    EXPECT_EQ(m_config.isvalidprofilename("x]z", 1), 0);
    EXPECT_THAT(messages.info(), ElementsAre(HasSubstr("[xz9]"), HasSubstr("\"x]z\"")));
    DeviceProfile::ProfileConfig none(nullptr, 1, ProfilePartUnbound);
    EXPECT_TRUE(none.get_profile() == nullptr && none.isvalid(0, 0) == 0 && none.isunsupported() == 0);
}

TEST_F(Config, ListsAndPrintsProfiles) {
    const MessageRecorder messages;
    m_config.make_list(nullptr, nullptr, 0);
    EXPECT_THAT(m_config.profiles(), ElementsAre("base", "xz7s10", "xz7s20", "Brennwick-1"));
    EXPECT_THAT(messages.status(), IsEmpty());
    m_config.make_list("tessal.acd", "XZ*", 1);
    EXPECT_THAT(messages.status(), ElementsAre("xz7s10\n", "xz7s20\n"));
    m_config.make_list("absent.acd", nullptr, 1);
    EXPECT_THAT(m_config.profiles(), IsEmpty());
}

TEST_F(Config, NamesDataAndHelpFiles) {
    EXPECT_EQ(taken(m_config.getdatafilename('a', "tessal", 1, 0)), path("tessal.acd"));
    EXPECT_EQ(taken(m_config.getdatafilename('a', "tessal.acd", 1, 0)), path("tessal.acd"));
    EXPECT_EQ(taken(m_config.getdatafilename('d', "proms", 1, 0)), path("proms.dat"));
    EXPECT_EQ(taken(m_config.getdatafilename(0, "proms", 1, 0)), "(null)");
    EXPECT_EQ(taken(m_config.getdatafilename('d', "proms", 1, 1)), "(null)");
    EXPECT_EQ(taken(m_config.getdatafilename('a', nullptr, 0, 0)), path("xz7s10.acd"));
    EXPECT_EQ(m_config.GetDatafileName('a', "none", true, 0), "");
    EXPECT_EQ(m_config.GetDatafileName('a', "none", false, 0), path("none.acd").c_str());
    EXPECT_THAT(*m_config.getdatafiles("*.ACD"), ElementsAre(path("tessal.acd").c_str()));
    EXPECT_THAT(*m_config.getdatafiles("*s*.*a*"), ElementsAre(path("proms.dat").c_str(), path("tessal.acd").c_str()));
    EXPECT_EQ(taken(m_config.gethelpfilename('t', "guide", 1, 0)), path("guide.txt"));
    EXPECT_EQ(taken(m_config.gethelpfilename('h', "guide", 1, 0)), "(null)");
}

TEST_F(Config, NamesProgramsAndLibraries) {
    EXPECT_THAT(fs::u8path(taken(m_config.getexecfilename('x', "tool", 0))).stem(), "tool");
    EXPECT_EQ(taken(m_config.getexecfilename('x', "tool", 1)), "(null)");
    EXPECT_EQ(taken(m_config.getexecfilename('x', nullptr, 0)), "(null)");
    const fs::path library = fs::u8path(taken(m_config.getdllfilename("Tool")));
    EXPECT_EQ(library.stem(), "libTool");
    EXPECT_TRUE(fs::exists(library.parent_path() /
                           fs::u8path("test_keyed").replace_extension(library.extension() == ".dll" ? ".exe" : "")))
        << "the directory of this program";
    EXPECT_EQ(taken(m_config.getdllfilename("")), "(null)");
}

}  // namespace
