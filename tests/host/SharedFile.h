// Memory that several processes of a test share, zeroed at first: what they note there survives any of them.
#pragma once

#include <cstddef>
#include <string>

class SharedFile {
public:
    /// Maps the file @p path, which is made where it is not there.
    SharedFile(const std::string& path, std::size_t size);
    ~SharedFile();
    SharedFile(const SharedFile&) = delete;
    SharedFile& operator=(const SharedFile&) = delete;

    /// The memory as a T, whose all-zero form must be a valid one.
    template <class T>
    T& as() const {
        return *static_cast<T*>(m_address);
    }

private:
    void* m_address;
    std::size_t m_size;
};
