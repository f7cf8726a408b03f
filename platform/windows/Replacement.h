// What the writers of a file that replaces another one share.
#pragma once

#include <string>

namespace platform {

/// What a link that leads somewhere stands for; any other path stays.
std::wstring linkResolved(const std::wstring& path);

/// A name that nobody uses, in the directory of the path.
std::wstring temporaryBeside(const std::wstring& path);

}  // namespace platform
