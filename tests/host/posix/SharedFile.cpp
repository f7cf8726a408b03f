#include "../SharedFile.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <stdexcept>

SharedFile::SharedFile(const std::string& path, std::size_t size) : m_address(MAP_FAILED), m_size(size) {
    const int file = ::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0666);
    if (file != -1 && ::ftruncate(file, static_cast<off_t>(size)) == 0) {
        m_address = ::mmap(nullptr, size, PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
    }
    ::close(file);
    if (m_address == MAP_FAILED) {
        throw std::runtime_error("cannot share " + path);
    }
}

SharedFile::~SharedFile() {
    ::munmap(m_address, m_size);
}
