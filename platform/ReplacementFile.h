// A new file beside another one, which takes that one's place in one step when it is complete. Without that it leaves
// no trace, and what was there stays as it was.
#pragma once

#include <cstddef>
#include <memory>
#include <string>

namespace platform {

class ReplacementFile {
public:
    /// Makes the new file in the directory of @p path, which is neither null nor empty; a link stands for what it leads
    /// to. Not open where that cannot be done, and where the path holds a directory, a device or a protected file.
    explicit ReplacementFile(const char* path);
    ReplacementFile(const ReplacementFile&) = delete;
    ReplacementFile& operator=(const ReplacementFile&) = delete;
    /// Removes the new file unless it was put in place.
    ~ReplacementFile();

    bool isOpen() const;
    bool write(const char* data, std::size_t size);
    /// Ends the writing. False where the host lost something of it; a full disk may show only here.
    bool close();
    /// Gives the closed file its name.
    bool putInPlace();
    /// What the host says of the step that failed last.
    std::string problem() const;

private:
    struct Host;

    std::unique_ptr<Host> m_host;
};

}  // namespace platform
