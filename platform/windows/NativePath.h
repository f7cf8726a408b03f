// Path texts as this host takes them.
#pragma once

#include <string>

namespace platform {

std::wstring wideText(const char* utf8);
std::string utf8Text(const wchar_t* wide);

/// The path in wide characters with "\" for "/"; one near or past the host's 260 characters, and any if asked for, is
/// made absolute in the form without that limit (`\\?\C:\...`, `\\?\UNC\server\...`).
std::wstring nativePath(const char* path, bool alwaysUnlimited = false);

}  // namespace platform
