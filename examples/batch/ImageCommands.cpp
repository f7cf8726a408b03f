#include "ImageCommands.h"

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <optional>
#include <string>
#include <vector>

#include "ByteProgress.h"
#include "Chain.h"
#include "DataFile.h"
#include "Quoting.h"
#include "Session.h"
#include "Verify.h"

namespace {

using PartList = std::vector<promPartAndSizePair>;

PartList allParts() {
    PartList parts = PromUtility::GetPromList();
    const PartList extended = PromUtility::GetExtendedPromList();
    parts.insert(parts.end(), extended.begin(), extended.end());
    return parts;
}

/// The size of a part in bytes; none, after a message, where the catalogue does not tell it.
std::optional<std::uint64_t> sizeOfPart(const Session& session, const char* part) {
    const int size = PromUtility::GetExtendedPromSizeByName(part);
    if (size > 0) {
        return static_cast<std::uint64_t>(size);
    }
    std::vector<HkString> names;
    for (const promPartAndSizePair& known : allParts()) {
        names.push_back(known.partName);
    }
    const char* const nearest = HkCmdArgs::nearest(part, names);
    session.say("checksum: unknown part " + quoted(part) +
                (nearest != nullptr ? std::string("; did you mean ") + nearest + '?' : ""));
    return std::nullopt;
}

/// One file and the PROM that is to hold it.
struct Content {
    std::string path;
    std::uint64_t size = 0;
    std::uint64_t promSize = 0;
};

/// What keeps a file from being summed; empty where nothing does.
std::string measure(Content& content, std::optional<std::uint64_t> promSize) {
    if (std::string problem = findSize(content.path, content.size); !problem.empty()) {
        return problem;
    }
    content.promSize = promSize.value_or(content.size);
    if (content.size > content.promSize) {
        return "holds " + std::to_string(content.size) + " bytes, the PROM " + std::to_string(content.promSize);
    }
    return content.promSize > mostBytes ? tooLarge : "";
}

int bitsOf(std::uint64_t bytes) {
    return static_cast<int>(bytes * 8);
}

/// Adds the bytes of a file, row by row. False where the file is shorter than it was.
bool addRows(const Content& content, int& sum) {
    constexpr std::uint64_t longestRow = 64 << 10;
    ByteProgress progress(("checksum of " + content.path).c_str(), content.size);
    std::ifstream file(std::filesystem::u8path(content.path), std::ios::binary);
    std::vector<char> bytes(longestRow);
    int none = 0;
    for (std::uint64_t done = 0; done < content.size;) {
        const std::uint64_t count = std::min(longestRow, content.size - done);
        if (!file.read(bytes.data(), static_cast<std::streamsize>(count))) {
            return false;
        }
        RLBitVec row(reinterpret_cast<const unsigned char*>(bytes.data()), count * 8);
        PromUtility::rowChecksum(0, nullptr, 0, &row, bitsOf(count), false, none, sum, bitsOf(done), 0);
        done += count;
        progress.add(count);
    }
    return true;
}

/// Adds what the file leaves open of its PROM, and has the library tell the sum and how it compares.
void conclude(const Content& content, unsigned int expected, int& sum) {
    constexpr unsigned int erased = 0xFF;
    // The open bytes are added to both sums, so they are taken from the expected one before.
    int target = static_cast<int>(expected - erased * static_cast<unsigned int>(content.promSize - content.size));
    delete[] PromUtility::rowChecksum(0, nullptr, 0, nullptr, 0, true, target, sum, bitsOf(content.size),
                                      bitsOf(content.promSize));
}

bool checksumOfFile(const Session& session, Content content, std::optional<std::uint64_t> promSize,
                    std::optional<unsigned int> expected) {
    int sum = 0;
    std::string problem = measure(content, promSize);
    if (problem.empty() && !addRows(content, sum)) {
        problem = "cannot be read to its end";
    }
    if (!problem.empty()) {
        session.say(quotedWhereNeeded(content.path) + ' ' + problem);
        return false;
    }
    conclude(content, expected.value_or(0), sum);
    return !expected || *expected == static_cast<unsigned int>(sum);
}

}  // namespace

bool generate(Session& session, const HkCmdArgs&) {
    return PromUtility::generate(&session.tokens());
}

bool checksum(Session& session, const HkCmdArgs& args) {
    std::optional<std::uint64_t> promSize;
    if (const char* const part = args.text("-part")) {
        promSize = sizeOfPart(session, part);
        if (!promSize) {
            return false;
        }
    }
    std::optional<unsigned int> expected;
    if (args.isGiven("-expect")) {
        expected = args.hex("-expect");
    }
    if (args.isGiven("-p")) {
        return forEachProm(session, args, [&](Prom& prom) { return sumProm(prom, expected); });
    }
    bool isGood = true;
    for (const HkString& path : args.list("-file")) {
        isGood = checksumOfFile(session, {std::string(path.view())}, promSize, expected) && isGood;
    }
    return isGood;
}

void listProms(const char* family) {
    const PartList parts = family != nullptr ? PromUtility::GetSpecificPromList(family) : allParts();
    std::printf("  %-10s %10s\n", "part", "bytes");
    for (const promPartAndSizePair& part : parts) {
        std::printf("  %-10s %10s\n", part.partName.c_str(), part.sizeText.c_str());
    }
}
