#include "deviceprofile/FileText.h"

#include <algorithm>
#include <cstring>
#include <fstream>
#include <system_error>

#include "platform/LargeMemory.h"
#include "s/UnitOrigin.h"

namespace DeviceProfile {
namespace {

namespace fs = std::filesystem;

constexpr UnitOrigin origin{"../s/FileText", "$Revision: 1.1 $"};

/// Far above any data file; places in a file are counted in 32 bits.
constexpr std::size_t largestFile = std::size_t{1} << 30;

/// A file is text unless many of its first bytes are control characters that no text has.
constexpr std::size_t sampleSize = 4096;
constexpr std::size_t controlsSuspected = 64;
constexpr std::size_t controlShare = 20;

/// Written without branches, so that many bytes are looked at at once.
unsigned isControl(unsigned char byte) {
    const auto between = [byte](unsigned first, unsigned last) { return byte - first <= last - first ? 1U : 0U; };
    return between(0, '\t' - 1) | between('\r' + 1, ' ' - 1) | between(0x7F, 0x7F);
}

bool isBinary(const FileText& text) {
    const std::size_t size = std::min(text.size, sampleSize);
    unsigned controls = 0;
    for (std::size_t i = 0; i < size; ++i) {
        controls += isControl(static_cast<unsigned char>(text.bytes[i]));
    }
    return controls >= controlsSuspected && controls > size / controlShare;
}

/// Makes room for one more byte than @p size, keeping what is there.
void reserve(FileText& text, std::size_t size) {
    std::unique_ptr<char[]> larger(new char[size + 1]);
    platform::preferLargePages(larger.get(), size + 1);
    if (text.size != 0) {
        std::memcpy(larger.get(), text.bytes.get(), text.size);
    }
    text.bytes = std::move(larger);
}

/// Reads to the end, whatever size the host told: some files change or have none.
const char* readAll(std::ifstream& stream, std::size_t expected, FileText& text) {
    std::size_t room = expected + 1;
    reserve(text, room);
    while (stream.read(text.bytes.get() + text.size, static_cast<std::streamsize>(room - text.size))) {
        text.size = room;
        if (room > largestFile) {
            return "is too large";
        }
        room *= 2;
        reserve(text, room);
    }
    text.size += static_cast<std::size_t>(stream.gcount());
    return stream.bad() ? "cannot be read" : nullptr;
}

/// The problem of an entry that is not a plain file, or null. Opening a pipe or a device could wait for ever.
const char* problemOfKind(fs::file_type type) {
    switch (type) {
        case fs::file_type::regular:
            return nullptr;
        case fs::file_type::not_found:
            return "does not exist";
        case fs::file_type::directory:
            return "is a directory";
        case fs::file_type::none:
        case fs::file_type::unknown:
            return "cannot be looked at";
        default:
            return "is no plain file";
    }
}

}  // namespace

const char* readBytes(const fs::path& path, FileText& result) {
    std::error_code error;
    const std::uintmax_t size = fs::file_size(path, error);
    const char* const kindProblem = error ? problemOfKind(fs::status(path, error).type()) : nullptr;
    if (kindProblem != nullptr) {
        return kindProblem;
    }
    if (!error && size > largestFile) {
        return "is too large";
    }
    std::ifstream stream(path, std::ios::binary);
    if (!stream) {
        return "cannot be opened";
    }
    FileText text;
    text.name = path.u8string();
    if (const char* const problem = readAll(stream, error ? 0 : static_cast<std::size_t>(size), text)) {
        return problem;
    }
    result = std::move(text);
    return nullptr;
}

const char* readFile(const fs::path& path, FileText& result) {
    FileText text;
    if (const char* const problem = readBytes(path, text)) {
        return problem;
    }
    if (isBinary(text)) {
        return "is binary";
    }
    result = std::move(text);
    return nullptr;
}

FileText openDataFile(const std::string& name, bool report) {
    FileText text;
    std::string problems;
    for (const fs::path& place : placesOf(name)) {
        const char* const problem = readFile(place, text);
        if (problem == nullptr) {
            return text;
        }
        std::error_code error;
        if (fs::exists(place, error)) {
            problems += "; " + place.u8string() + " " + problem;
        }
    }
    reserve(text, 0);
    if (report) {
        const SearchPath search = searchPath();
        origin.report().issueInfo("Data file \"%s\" cannot be read: searched \"%s\", given by %s%s.\n", name.c_str(),
                                  search.text().c_str(), search.source, problems.c_str());
    }
    return text;
}

}  // namespace DeviceProfile
