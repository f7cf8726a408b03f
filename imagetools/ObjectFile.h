// A data file in memory: its bytes and where they go.
#pragma once

#include "deviceprofile/FileText.h"
#include "imagetools/MemReader.h"
#include "imagetools/SegmentMap.h"

namespace ImageTools {

enum class FileKind { Raw, Elf, Mem };

/// By the extension in any case; what is neither "elf" nor "mem" is raw.
FileKind kindOf(const char* path);

/// The segments of a raw file are its bytes from address 0.
struct LoadedFile {
    DeviceProfile::FileText backing;  ///< what the segments point into
    SegmentMap segments;

    unsigned char* bytes() { return reinterpret_cast<unsigned char*>(backing.bytes.get()); }
};

enum class LoadResult { Done, Unreadable, Malformed };

/// Reads a file; reports what is wrong with it.
LoadResult loadFile(const char* path, FileKind kind, const MemOptions& options, LoadedFile& file);

}  // namespace ImageTools
