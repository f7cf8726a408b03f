/// @file
/// Selection of a device profile.
#pragma once

#include <memory>
#include <vector>

#include "HkString.h"
#include "TessalExport.h"

/// How a selection is bound to the part it names. Kept with the selection and shown by printme; the profile is found
/// by its name alone.
using ProfilePartBinding = int;
constexpr ProfilePartBinding ProfilePartUnbound = 0;
constexpr ProfilePartBinding ProfilePartBound = 1;

/// Root of the selection classes: the profile's name, and the files that belong to the tool.
///
/// A profile is a section of a data file: "base", or a device. Texts of type `char*` that an operation makes are
/// released by the caller with `delete[]`. The order of the virtual operations is fixed.
class TESSAL_API ProfileSpec {
public:
    ProfileSpec(const ProfileSpec&) = delete;
    ProfileSpec& operator=(const ProfileSpec&) = delete;
    virtual ~ProfileSpec();

    /// Selects another profile. Gives 1, or 0 and leaves the selection as it was when the text cannot be the name of
    /// a profile.
    virtual unsigned char set_profile(const char* name) = 0;

    /// 1 when a profile is selected and, with @p inData, "tessal.acd" has a section of its name; else 0, which
    /// @p report makes an information message too.
    virtual unsigned char isvalid(unsigned char inData, unsigned char report) = 0;

    /// 1 when the text can be the name of a section: not empty, printable, without `[` and `]`, no blank at either
    /// end; else 0, which @p report makes an information message too.
    virtual unsigned char isvalidprofilename(const char* name, unsigned char report);

    /// 1 when a profile is selected of which "tessal.acd" knows nothing.
    virtual unsigned char isunsupported() const;

    /// Fills the list that profiles() gives with the sections of a data file, in the order of the file.
    ///
    /// @param dataFile file name; null stands for "tessal.acd"
    /// @param pattern names to take, `*` standing for any run of characters, without regard to case; null takes all
    /// @param print non-zero: each name is also printed as a status message
    virtual void make_list(const char* dataFile, const char* pattern, unsigned char print) = 0;

    /// The path of a data file.
    ///
    /// @param kind adds the ending that the name lacks: `a` ".acd", `d` ".dat", any other value none
    /// @param name file name; null stands for the profile's name
    /// @param mustExist non-zero: only files that exist count; 0: the place in each directory counts
    /// @param index which one, counted from 0 in the order of the directories
    /// @return the path in a new text, or null when there is none
    virtual char* getdatafilename(char kind, const char* name, unsigned char mustExist, int index) const;

    /// As getdatafilename; empty when there is none.
    virtual HkString GetDatafileName(char kind, const char* name, bool mustExist, int index) const;

    /// The paths of all data files whose names match the pattern (`*` for any run of characters, case does not
    /// count), in the order of the directories and sorted within each.
    virtual std::unique_ptr<std::vector<HkString>> getdatafiles(const HkString& pattern) const;

    /// The path of a help file, which lies beside the data files: as getdatafilename, with the kinds `t` ".txt" and
    /// `h` ".html".
    virtual char* gethelpfilename(char kind, const char* name, unsigned char mustExist, int index) const;

    /// The path of a program of the installation, in its directory "bin", in a new text.
    ///
    /// @param kind `x` adds the ending of programs on this host where the name lacks it, any other value none
    /// @param name file name; null or empty gives null
    /// @param mustExist non-zero: null when there is no such file
    virtual char* getexecfilename(char kind, const char* name, unsigned char mustExist) const;

    /// The path of a shared library beside this one, in a new text; the name comes without the host's prefix and
    /// ending. Null or empty gives null. The file need not exist.
    virtual char* getdllfilename(const char* name) const;

    /// Prints the selection as one status message behind the title; null stands for no title.
    virtual void printme(const char* title) const = 0;

    /// The name of the selected profile, or null when there is none. The text stays owned by the object and ends with
    /// the next set_profile.
    char* get_profile() const { return m_profile.get(); }

protected:
    ProfileSpec() = default;

    /// Copies the name; null or empty selects nothing.
    void setName(const char* name);

private:
    std::unique_ptr<char[]> m_profile;
};

/// A selection that can be changed, checked and listed.
class TESSAL_API ProfilePick : public ProfileSpec {
public:
    ~ProfilePick() override;

    unsigned char set_profile(const char* name) override;
    unsigned char isvalid(unsigned char inData, unsigned char report) override;
    void make_list(const char* dataFile, const char* pattern, unsigned char print) override;
    void printme(const char* title) const override;

    /// What the last make_list found.
    const std::vector<HkString>& profiles() const { return m_profiles; }
    unsigned char flag() const { return m_flag; }
    ProfilePartBinding binding() const { return m_binding; }

protected:
    ProfilePick(const char* name, unsigned char flag, ProfilePartBinding binding);

private:
    std::vector<HkString> m_profiles;
    unsigned char m_flag;
    ProfilePartBinding m_binding;
};

namespace DeviceProfile {

/// The selection of a profile by name.
class TESSAL_API ProfileConfig : public ProfilePick {
public:
    /// Selects the profile @p name, "base" or a device, whether or not a data file knows it; null or empty selects
    /// none. @p flag and @p binding are kept and shown by printme.
    ProfileConfig(const char* name, unsigned char flag, ProfilePartBinding binding);
    ~ProfileConfig() override;
};

}  // namespace DeviceProfile

using DeviceProfile::ProfileConfig;
