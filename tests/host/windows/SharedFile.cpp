#include "../SharedFile.h"

#include <windows.h>

#include <stdexcept>

SharedFile::SharedFile(const std::string& path, std::size_t size) : m_address(nullptr), m_size(size) {
    const HANDLE file = ::CreateFileA(path.c_str(), GENERIC_READ | GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE,
                                      nullptr, OPEN_ALWAYS, 0, nullptr);
    const HANDLE mapping = ::CreateFileMappingA(file, nullptr, PAGE_READWRITE, 0, static_cast<DWORD>(size), nullptr);
    if (mapping != nullptr) {
        m_address = ::MapViewOfFile(mapping, FILE_MAP_ALL_ACCESS, 0, 0, size);
        ::CloseHandle(mapping);
    }
    ::CloseHandle(file);
    if (m_address == nullptr) {
        throw std::runtime_error("cannot share " + path);
    }
}

SharedFile::~SharedFile() {
    ::UnmapViewOfFile(m_address);
}
