#include "HkException.h"

#include <algorithm>
#include <cstdio>
#include <iterator>

#include "HkMessageManager.h"

namespace HostKit {

HkException::HkException(const char* meaning, const char* module, const char* file, const char* revision,
                         int line) noexcept
    : m_meaning(meaning), m_module(module), m_file(file), m_revision(revision), m_line(line) {
    compose();
}

HkException::~HkException() = default;

void HkException::compose() noexcept {
    const auto shown = [](const char* text) { return text != nullptr ? text : "?"; };
    std::snprintf(m_text, sizeof m_text, "%s (%s %s, line %d, %s)", shown(m_meaning), shown(m_module), shown(m_file),
                  m_line, shown(m_revision));
    std::transform(std::begin(m_text), std::end(m_text), std::begin(m_localized),
                   [](char c) { return static_cast<wchar_t>(static_cast<unsigned char>(c)); });
}

const wchar_t* HkException::getLocalized() const {
    return m_localized;
}

void HkException::report() const {
    HkMessageManager::createObject(m_module, m_file, m_line, m_revision).issueInfo("%s\n", m_text);
}

}  // namespace HostKit
