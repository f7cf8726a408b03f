#include "platform/posix/PortTree.h"

#include <array>
#include <cinttypes>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <sstream>
#include <system_error>

#include "platform/FileSystem.h"

namespace platform {
namespace {

/// A text such as "  03f8-03ff : serial".
std::optional<IoRange> rangeAt(const std::string& line, std::string& owner) {
    IoRange range;
    int ownerAt = 0;
    if (std::sscanf(line.c_str(), " %" SCNx64 "-%" SCNx64 " : %n", &range.start, &range.end, &ownerAt) != 2 ||
        ownerAt == 0 || range.end < range.start) {
        return std::nullopt;
    }
    owner = line.substr(static_cast<std::size_t>(ownerAt));
    return range;
}

}  // namespace

std::vector<std::string> PortTree::names(const std::string& directory) const {
    return listDirectory((m_root + directory).c_str(), false);
}

std::optional<std::string> PortTree::read(const std::string& file) const {
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> stream(openFile((m_root + file).c_str(), "rb"), &std::fclose);
    if (stream == nullptr) {
        return std::nullopt;
    }
    std::string text(std::size_t{1} << 16, '\0');
    text.resize(std::fread(text.data(), 1, text.size(), stream.get()));
    return text;
}

std::string PortTree::linkedName(const std::string& link) const {
    std::error_code error;
    return std::filesystem::read_symlink(m_root + link, error).filename().string();
}

ClaimedRanges::ClaimedRanges(const std::string& lines) {
    std::istringstream stream(lines);
    for (std::string line; std::getline(stream, line);) {
        Claim claim;
        if (const std::optional<IoRange> range = rangeAt(line, claim.owner)) {
            claim.range = *range;
            m_claims.push_back(claim);
        }
    }
}

IoRange ClaimedRanges::from(std::uint64_t start, unsigned registers) const {
    const Claim* innermost = nullptr;
    for (const Claim& claim : m_claims) {
        if (claim.range.start == start) {
            innermost = &claim;
        }
    }
    if (innermost == nullptr) {
        return {start, start + registers - 1};
    }
    // The kernel's lines are sorted, an inner range behind the outer one.
    IoRange range = innermost->range;
    for (const Claim& claim : m_claims) {
        if (claim.range.start == range.end + 1 && claim.owner == innermost->owner) {
            range.end = claim.range.end;
        }
    }
    return range;
}

}  // namespace platform
