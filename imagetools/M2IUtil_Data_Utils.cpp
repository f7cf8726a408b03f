#include "M2IUtil_Data_Utils.h"

#include "imagetools/ObjectFile.h"

namespace {

using namespace ImageTools;
using Mapping = M2IUtil_BramMapping;

MemOptions memOptions(DataDumpType type) {
    return {(type & DUMP_LEAST_SIGNIFICANT_FIRST) != 0, (type & DUMP_BYTE_ADDRESSES) != 0,
            (type & DUMP_FILL_UNKNOWN) != 0};
}

Mapping::M2IUtil_Results resultOf(LoadResult result) {
    switch (result) {
        case LoadResult::Done:
            return Mapping::M2IUTIL_SUCCESS;
        case LoadResult::Unreadable:
            return Mapping::M2IUTIL_UNREADABLE;
        default:
            return Mapping::M2IUTIL_MALFORMED;
    }
}

}  // namespace

M2IUtil_Data_Utils::M2IUtil_Data_Utils(const char* path, DataDumpType dumpType, Mapping::M2IUtil_Results* result) {
    LoadedFile file;
    const FileKind kind = kindOf(path) == FileKind::Mem ? FileKind::Mem : FileKind::Elf;
    const LoadResult loaded = loadFile(path, kind, memOptions(dumpType), file);
    if (loaded == LoadResult::Done) {
        m_lowest = static_cast<unsigned int>(file.segments.lowest());
        m_highest = static_cast<unsigned int>(file.segments.end());
    }
    if (result != nullptr) {
        *result = resultOf(loaded);
    }
}

void M2IUtil_Data_Utils::GetProgramSectionAddressRange(unsigned int* lowest, unsigned int* highest) const {
    if (lowest != nullptr) {
        *lowest = m_lowest;
    }
    if (highest != nullptr) {
        *highest = m_highest;
    }
}
