// The files of one run: all of them take their places, or none does.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "imagetools/PromFormat.h"
#include "imagetools/Texts.h"
#include "platform/ReplacementFile.h"

namespace ImageTools {

class PromFileSet {
public:
    /// Writes a file beside the one of that path, which stays as it is.
    Problem write(const std::string& path, const PromFormat& format, const PromContent& content);

    /// Puts all the files in place. After a problem the former ones are there again.
    Problem putInPlace();

private:
    struct Entry {
        std::string path;
        std::unique_ptr<platform::ReplacementFile> file;
        std::string former;  ///< a copy of the file that was replaced; empty where there was none
    };

    Problem putInPlace(Entry& entry, bool isLast);
    static void putBack(const Entry& entry);

    std::vector<Entry> m_entries;
};

}  // namespace ImageTools
