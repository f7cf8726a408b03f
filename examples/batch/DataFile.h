// Files of raw bytes: the image that a PROM is programmed with, and the one that is read back.
#pragma once

#include <cstddef>
#include <cstdint>
#include <fstream>
#include <string>
#include <vector>

using Bytes = std::vector<unsigned char>;

/// True for a file whose name tells another format than raw bytes, such as "board.mcs".
bool isTextFormat(const std::string& path);

/// As many bytes of a file or PROM can be dealt with: those whose bits a row checksum can count.
constexpr std::uint64_t mostBytes = 0x0FFFFFFF;
constexpr char tooLarge[] = "is larger than 256 MiB";

/// Finds the size of a file of raw bytes. What keeps it from being read; empty where nothing does.
std::string findSize(const std::string& path, std::uint64_t& size);

/// Reads a file of raw bytes. What keeps it from being read; empty where nothing does.
std::string readBytes(const std::string& path, Bytes& bytes);

/// A file that is written aside and gets its name when it is complete. Until then, and after a failure, what was there
/// under that name stays as it was.
class NewFile {
public:
    explicit NewFile(const std::string& path);
    NewFile(const NewFile&) = delete;
    NewFile& operator=(const NewFile&) = delete;
    /// Removes what was written, unless it was completed.
    ~NewFile();

    bool write(const unsigned char* bytes, std::size_t length);
    bool complete();

private:
    std::string m_path;
    std::string m_aside;
    std::ofstream m_stream;
};
