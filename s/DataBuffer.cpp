#include "DataBuffer.h"

#include <cstring>
#include <functional>
#include <limits>
#include <string>
#include <utility>

#include "HkMemory.h"
#include "HkMessageManager.h"
#include "HkStr.h"

namespace {

constexpr int growthMargin = 1024;

}  // namespace

DataBuffer::DataBuffer(int size) {
    if (size > 0) {
        m_data = static_cast<char*>(hk_malloc(static_cast<std::size_t>(size)));
        m_capacity = m_data != nullptr ? size : 0;
    }
}

DataBuffer::DataBuffer(const DataBuffer& other) : DataBuffer(other.m_capacity) {
    if (m_capacity > 0) {
        std::memcpy(m_data, other.m_data, static_cast<std::size_t>(m_capacity));
        m_position = other.m_position;
    }
}

DataBuffer& DataBuffer::operator=(const DataBuffer& other) {
    DataBuffer copy(other);
    std::swap(m_position, copy.m_position);
    std::swap(m_capacity, copy.m_capacity);
    std::swap(m_data, copy.m_data);
    return *this;
}

DataBuffer::~DataBuffer() {
    hk_free(m_data);
}

void DataBuffer::write(const char* data, int length) {
    if (data == nullptr || length < 1) {
        return;
    }
    const std::ptrdiff_t own = placeInside(data);
    if (hasSpace(length)) {
        std::memmove(m_data + m_position, own < 0 ? data : m_data + own, static_cast<std::size_t>(length));
        m_position += length;
    }
}

void DataBuffer::writeString(const char* text) {
    constexpr std::size_t longest = std::numeric_limits<int>::max();
    const std::size_t length = HkStr::Len(text);
    if (length > longest) {
        HkMessageManager::debugStub("Error reallocating space in DataBuffer.\n");
        return;
    }
    if (placeInside(text) >= 0) {
        const std::string copy(text, length);  // the length may be written over the text
        writeInt(static_cast<int>(length));
        write(copy.data(), static_cast<int>(length));
        return;
    }
    writeInt(static_cast<int>(length));
    write(text, static_cast<int>(length));
}

/// Where in the buffer @p data points, for it moves when the buffer grows; -1 for anywhere else.
std::ptrdiff_t DataBuffer::placeInside(const char* data) const {
    const std::less<> before;
    const bool inside = m_data != nullptr && !before(data, m_data) && before(data, m_data + m_capacity);
    return inside ? data - m_data : -1;
}

bool DataBuffer::checkBufferSpace(int requested) {
    const std::int64_t needed = std::int64_t{m_position} + requested;
    const std::int64_t capacity = std::int64_t{m_capacity} + requested + growthMargin;
    void* const grown =
        capacity <= std::numeric_limits<int>::max() ? hk_realloc(m_data, static_cast<std::size_t>(capacity)) : nullptr;
    if (grown == nullptr) {
        HkMessageManager::debugStub("Error reallocating space in DataBuffer.\n");
        return false;
    }
    m_data = static_cast<char*>(grown);
    m_capacity = static_cast<int>(capacity);
    HkMessageManager::debugStub("New buffer size = %d. Requested size = %d.\n", m_capacity, static_cast<int>(needed));
    return true;
}
