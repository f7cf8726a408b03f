#include "HkDir.h"

#include <algorithm>
#include <cstring>
#include <utility>

#include "HkStr.h"
#include "platform/FileSystem.h"

namespace HostKit {
namespace {

bool matchesAll(const char* pattern) {
    return pattern == nullptr || std::strcmp(pattern, "*.*") == 0;
}

}  // namespace

HkDirIterator::HkDirIterator(Names names) : m_names(std::make_shared<const Names>(std::move(names))) {
    settle();
}

void HkDirIterator::settle() {
    m_name = m_index < m_names->size() ? (*m_names)[m_index].c_str() : nullptr;
}

HkDirIterator& HkDirIterator::operator++() {
    if (m_name != nullptr) {
        ++m_index;
        settle();
    }
    return *this;
}

HkDir::HkDir(const char* path, unsigned char flag) : m_path(path != nullptr ? path : ""), m_flag(flag) {}

HkDirIterator HkDir::begin(const char* pattern) const {
    if (m_path.empty()) {
        return end();
    }
    std::vector<std::string> names = platform::listDirectory(m_path.c_str(), m_flag != 0);
    if (!matchesAll(pattern)) {
        const auto differs = [pattern](const std::string& name) { return HkStr::IMatch(name.c_str(), pattern) == 0; };
        names.erase(std::remove_if(names.begin(), names.end(), differs), names.end());
    }
    return HkDirIterator(std::move(names));
}

}  // namespace HostKit
