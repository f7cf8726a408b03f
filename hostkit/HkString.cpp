#include "HkString.h"

#include <atomic>
#include <cstdarg>
#include <cstddef>
#include <cstdio>
#include <cstring>
#include <new>
#include <stdexcept>
#include <string>

#include "HkStr.h"

namespace HostKit {
namespace {

/// What stands before the text; the length word is the last of it.
struct Block {
    std::atomic<std::uint32_t> owners;
    std::uint32_t capacity;
    std::uint32_t unused;
    std::uint32_t length;
};
static_assert(sizeof(Block) == 16 && offsetof(Block, length) == 12, "the length word stands directly before the text");

/// The text of every empty string that owns no memory; never counted, written or released.
struct EmptyText {
    Block block;
    char terminator;
};
EmptyText emptyText{{{0}, 0, 0, 0}, '\0'};

char* sharedEmpty() {
    return &emptyText.terminator;
}

Block& blockOf(char* text) {
    return reinterpret_cast<Block*>(text)[-1];
}

char* allocate(std::size_t capacity) {
    if (capacity >= HkString::npos) {
        throw std::length_error("HkString: the text would be too long");
    }
    void* const memory = ::operator new(sizeof(Block) + capacity + 1);
    return reinterpret_cast<char*>(new (memory) Block{{1}, static_cast<std::uint32_t>(capacity), 0, 0} + 1);
}

void setLength(char* text, std::size_t length) {
    blockOf(text).length = static_cast<std::uint32_t>(length);
    text[length] = '\0';
}

char* makeText(std::string_view content) {
    if (content.empty()) {
        return sharedEmpty();
    }
    char* const text = allocate(content.size());
    std::memcpy(text, content.data(), content.size());
    setLength(text, content.size());
    return text;
}

char* share(char* text) noexcept {
    if (text != sharedEmpty()) {
        blockOf(text).owners.fetch_add(1, std::memory_order_relaxed);
    }
    return text;
}

void release(char* text) noexcept {
    if (text != sharedEmpty() && blockOf(text).owners.fetch_sub(1, std::memory_order_acq_rel) == 1) {
        ::operator delete(&blockOf(text));
    }
}

bool isOwnedAlone(char* text) {
    return text != sharedEmpty() && blockOf(text).owners.load(std::memory_order_acquire) == 1;
}

std::string_view viewOf(const char* text) {
    return {text != nullptr ? text : "", HkStr::Len(text)};
}

/// Room for a text of @p length bytes, with half as much again so that appending costs constant time a byte.
std::size_t grown(std::size_t length) {
    const std::size_t generous = length + length / 2 + 16;
    return generous < HkString::npos ? generous : length;
}

/// Makes the text one of this string alone that has room for @p room bytes.
void makeOwn(char*& text, std::size_t room) {
    if (isOwnedAlone(text) && blockOf(text).capacity >= room) {
        return;
    }
    const std::size_t length = blockOf(text).length;
    char* const own = allocate(length < room ? grown(room) : length);
    std::memcpy(own, text, length);
    setLength(own, length);
    release(text);
    text = own;
}

void append(char*& text, std::string_view content) {
    if (content.empty()) {
        return;
    }
    const std::size_t length = blockOf(text).length;
    char* const former = share(text);  // the content may lie in it
    const std::size_t room = length + content.size();
    if (blockOf(former).owners.load(std::memory_order_acquire) == 2 && blockOf(former).capacity >= room) {
        std::memmove(former + length, content.data(), content.size());
        setLength(former, room);
        release(former);
        return;
    }
    char* own = nullptr;
    try {
        own = allocate(grown(room));
    } catch (...) {
        release(former);
        throw;
    }
    std::memcpy(own, former, length);
    std::memcpy(own + length, content.data(), content.size());
    setLength(own, room);
    release(text);
    release(former);
    text = own;
}

}  // namespace

HkString::HkString() noexcept : m_text(sharedEmpty()) {}
HkString::HkString(const char* text) : m_text(makeText(viewOf(text))) {}
HkString::HkString(std::string_view text) : m_text(makeText(text)) {}
HkString::HkString(const HkString& other) noexcept : m_text(share(other.m_text)) {}
HkString::HkString(HkString&& other) noexcept : m_text(other.m_text) {
    other.m_text = sharedEmpty();
}
HkString::~HkString() {
    release(m_text);
}

HkString& HkString::operator=(const HkString& other) noexcept {
    char* const former = m_text;
    m_text = share(other.m_text);
    release(former);
    return *this;
}

HkString& HkString::operator=(HkString&& other) noexcept {
    char* const former = m_text;
    m_text = other.m_text;
    other.m_text = former;
    return *this;
}

HkString& HkString::operator=(const char* text) {
    char* const former = m_text;
    m_text = makeText(viewOf(text));
    release(former);
    return *this;
}

HkString& HkString::operator+=(const HkString& other) {
    append(m_text, other.view());
    return *this;
}

HkString& HkString::operator+=(const char* text) {
    append(m_text, viewOf(text));
    return *this;
}

HkString& HkString::operator+=(char ch) {
    append(m_text, {&ch, 1});
    return *this;
}

void HkString::Append(const char* text, std::uint32_t count) {
    append(m_text, text == nullptr ? std::string_view() : count == npos ? viewOf(text) : std::string_view(text, count));
}

void HkString::Empty() {
    release(m_text);
    m_text = sharedEmpty();
}

HkString& HkString::Format(const char* format, ...) {
    std::va_list arguments;
    std::va_list again;
    va_start(arguments, format);
    va_copy(again, arguments);
    const int length = format != nullptr ? std::vsnprintf(nullptr, 0, format, arguments) : 0;
    std::string formatted(length > 0 ? static_cast<std::size_t>(length) : 0, '\0');
    if (!formatted.empty()) {
        std::vsnprintf(formatted.data(), formatted.size() + 1, format, again);
    }
    va_end(again);
    va_end(arguments);
    return *this = HkString(std::string_view(formatted));
}

void HkString::Insert(std::uint32_t index, char ch, std::uint32_t count) {
    if (count == 0) {
        return;
    }
    const std::size_t length = Length();
    const std::size_t place = index < length ? index : length;
    makeOwn(m_text, length + count);
    std::memmove(m_text + place + count, m_text + place, length - place);
    std::memset(m_text + place, ch, count);
    setLength(m_text, length + count);
}

std::uint32_t HkString::GetIndexOfFirstChar(char ch, char second) const {
    const char wanted[] = {ch, second};
    const std::size_t index = view().find_first_of(std::string_view(wanted, second != '\0' ? 2 : 1));
    return index != std::string_view::npos ? static_cast<std::uint32_t>(index) : npos;
}

std::uint32_t HkString::GetIndexOfString(const char* text, CompareType mode) const {
    const std::string_view wanted = viewOf(text);
    if (mode == CompareExact) {
        const std::size_t index = view().find(wanted);
        return index != std::string_view::npos ? static_cast<std::uint32_t>(index) : npos;
    }
    for (std::size_t index = 0; index + wanted.size() <= Length(); ++index) {
        if (HkStr::INCompare(m_text + index, wanted.data(), wanted.size()) == 0) {
            return static_cast<std::uint32_t>(index);
        }
    }
    return npos;
}

void HkString::MakeUpper() {
    makeOwn(m_text, Length());
    for (char* c = m_text; c != m_text + Length(); ++c) {
        *c = HkStr::ToUpper(*c);
    }
}

void HkString::MakeLower() {
    makeOwn(m_text, Length());
    for (char* c = m_text; c != m_text + Length(); ++c) {
        *c = HkStr::ToLower(*c);
    }
}

}  // namespace HostKit
