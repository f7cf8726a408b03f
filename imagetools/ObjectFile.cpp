#include "imagetools/ObjectFile.h"

#include <algorithm>
#include <filesystem>
#include <string>
#include <utility>

#include "HkPath.h"
#include "HkStr.h"
#include "imagetools/ElfReader.h"
#include "s/UnitOrigin.h"

namespace ImageTools {
namespace {

constexpr UnitOrigin origin{"../s/ObjectFile", "$Revision: 1.1 $"};

void complain(const char* path, const std::string& text) {
    origin.report().issueInfo("%s: %s\n", path, text.c_str());
}

LoadResult parseElf(const char* path, LoadedFile& file) {
    std::string note;
    const Problem problem = readElf(ByteSource(file.bytes(), file.backing.size), file.segments, note);
    if (!problem.empty()) {
        complain(path, problem);
        return LoadResult::Malformed;
    }
    if (!note.empty()) {
        complain(path, note);
    }
    return LoadResult::Done;
}

LoadResult parseMem(const char* path, const MemOptions& options, LoadedFile& file) {
    const DeviceProfile::FileText text = std::move(file.backing);
    file.backing.size = text.size / 2 + 1;
    file.backing.bytes.reset(new char[file.backing.size]);
    const std::vector<std::string> problems =
        readMem({text.bytes.get(), text.size}, options, file.bytes(), file.segments);
    for (const std::string& problem : problems) {
        origin.report().issueInfo("%s:%s\n", path, problem.c_str());
    }
    return problems.empty() ? LoadResult::Done : LoadResult::Malformed;
}

}  // namespace

FileKind kindOf(const char* path) {
    const char* const extension = HkPath::GetExt(path, nullptr);
    if (HkStr::ICompare(extension, "elf") == 0) {
        return FileKind::Elf;
    }
    return HkStr::ICompare(extension, "mem") == 0 ? FileKind::Mem : FileKind::Raw;
}

LoadResult loadFile(const char* path, FileKind kind, const MemOptions& options, LoadedFile& file) {
    std::string native(HkStr::View(path));
    std::replace(native.begin(), native.end(), '\\', '/');
    if (const char* const problem = DeviceProfile::readBytes(std::filesystem::u8path(native), file.backing)) {
        complain(native.c_str(), problem);
        return LoadResult::Unreadable;
    }
    switch (kind) {
        case FileKind::Elf:
            return parseElf(path, file);
        case FileKind::Mem:
            return parseMem(path, options, file);
        default:
            file.segments.add({0, file.bytes(), file.backing.size});
            return LoadResult::Done;
    }
}

}  // namespace ImageTools
