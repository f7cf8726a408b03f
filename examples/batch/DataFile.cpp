#include "DataFile.h"

#include <TessalUtility.h>

#include <algorithm>
#include <filesystem>
#include <iterator>
#include <system_error>

bool isTextFormat(const std::string& path) {
    const char* const texts[] = {"mcs", "exo", "tek", "hex", "elf", "mem"};
    const char* const extension = HkPath::GetExt(path.c_str(), nullptr);
    return std::any_of(std::begin(texts), std::end(texts),
                       [=](const char* text) { return HkStr::ICompare(extension, text) == 0; });
}

std::string findSize(const std::string& path, std::uint64_t& size) {
    if (isTextFormat(path)) {
        return "is no binary file; generate -format bin writes one";
    }
    std::error_code error;
    size = std::filesystem::file_size(std::filesystem::u8path(path), error);
    return error ? "cannot be read" : "";
}

std::string readBytes(const std::string& path, Bytes& bytes) {
    std::uint64_t size = 0;
    if (std::string problem = findSize(path, size); !problem.empty()) {
        return problem;
    }
    if (size > mostBytes) {
        return tooLarge;
    }
    std::ifstream file(std::filesystem::u8path(path), std::ios::binary);
    bytes.resize(static_cast<std::size_t>(size));
    if (!file.read(reinterpret_cast<char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()))) {
        return "cannot be read";
    }
    return bytes.empty() ? "is empty" : "";
}

NewFile::NewFile(const std::string& path)
    : m_path(path), m_aside(path + ".part"), m_stream(std::filesystem::u8path(m_aside), std::ios::binary) {}

NewFile::~NewFile() {
    if (!m_aside.empty()) {
        m_stream.close();
        HkFile::remove_f(m_aside.c_str());
    }
}

bool NewFile::write(const unsigned char* bytes, std::size_t length) {
    return m_stream.write(reinterpret_cast<const char*>(bytes), static_cast<std::streamsize>(length)).good();
}

bool NewFile::complete() {
    m_stream.close();
    std::error_code error;
    if (!m_stream.fail()) {
        std::filesystem::rename(std::filesystem::u8path(m_aside), std::filesystem::u8path(m_path), error);
        if (!error) {
            m_aside.clear();
        }
    }
    return m_aside.empty();
}
