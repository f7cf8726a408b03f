#include "imagetools/PromFileSet.h"

#include <utility>

#include "HkFile.h"

namespace ImageTools {
namespace {

/// A name beside the path that nothing has.
std::string freeNameBeside(const std::string& path) {
    std::string name;
    int number = 0;
    do {
        name = path + ".old-" + std::to_string(number++);
    } while (HkFile::exist(name.c_str()));
    return name;
}

Problem failure(const std::string& path, const char* what, const platform::ReplacementFile& file) {
    return path + ": " + what + ": " + file.problem();
}

}  // namespace

Problem PromFileSet::write(const std::string& path, const PromFormat& format, const PromContent& content) {
    auto file = std::make_unique<platform::ReplacementFile>(path.c_str());
    if (!file->isOpen()) {
        return failure(path, "cannot be made or replaced", *file);
    }
    RecordSink sink(*file);
    format.write(content, sink);
    if (!sink.flush() || !file->close()) {
        return failure(path, "cannot be written", *file);
    }
    m_entries.push_back({path, std::move(file), {}});
    return {};
}

Problem PromFileSet::putInPlace() {
    Problem problem;
    std::size_t placed = 0;
    while (problem.empty() && placed < m_entries.size()) {
        problem = putInPlace(m_entries[placed], placed + 1 == m_entries.size());
        placed += problem.empty() ? 1 : 0;
    }
    for (std::size_t i = 0; i < placed; ++i) {
        if (!problem.empty()) {
            putBack(m_entries[i]);
        } else if (!m_entries[i].former.empty()) {
            HkFile::remove_f(m_entries[i].former.c_str());
        }
    }
    return problem;
}

Problem PromFileSet::putInPlace(Entry& entry, bool isLast) {
    const bool mayHaveToGoBack = !isLast && HkFile::exist(entry.path.c_str());
    if (mayHaveToGoBack) {
        entry.former = freeNameBeside(entry.path);
        if (!HkFile::copy(entry.path.c_str(), entry.former.c_str())) {
            return entry.path + ": the former file cannot be kept while the new ones take their places";
        }
    }
    if (entry.file->putInPlace()) {
        return {};
    }
    if (mayHaveToGoBack) {
        HkFile::remove_f(entry.former.c_str());
    }
    return failure(entry.path, "cannot be replaced", *entry.file);
}

void PromFileSet::putBack(const Entry& entry) {
    if (entry.former.empty()) {
        HkFile::remove_f(entry.path.c_str());
    } else if (HkFile::copy(entry.former.c_str(), entry.path.c_str())) {
        HkFile::remove_f(entry.former.c_str());
    }
}

}  // namespace ImageTools
