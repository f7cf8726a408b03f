#include "TessalSmokeMgr.h"

#include <cstdarg>

#include "HkFile.h"

TessalSmokeMgr::TessalSmokeMgr() = default;

TessalSmokeMgr::TessalSmokeMgr(const char* fileName) : m_file(HkFile::open(fileName, "w")), m_fileName(fileName) {}

TessalSmokeMgr::~TessalSmokeMgr() {
    if (m_file != nullptr) {
        std::fclose(m_file);
        m_file = nullptr;
    }
}

bool TessalSmokeMgr::smokeStatus(const char* format, ...) {
    if (m_file == nullptr || format == nullptr) {
        return false;
    }
    std::va_list arguments;
    va_start(arguments, format);
    const int written = std::vfprintf(m_file, format, arguments);
    va_end(arguments);
    return written != 0;
}

bool TessalSmokeMgr::open(const char* /*fileName*/) {
    return true;
}

bool TessalSmokeMgr::close() {
    return true;
}
