#include "HkString.h"

#include <algorithm>
#include <cstdarg>
#include <cstdio>
#include <new>
#include <stdexcept>
#include <string>

#include "HkStr.h"
#include "SmallBlocks.h"
#include "platform/SingleThread.h"

namespace HostKit {
namespace {

constexpr std::size_t headSize = 16;
constexpr std::size_t smallRoom = SmallBlocks::size - headSize;  ///< for a short text with its terminator
constexpr std::size_t smallCapacity = smallRoom - 1;

/// Room for a text of @p length bytes, and as much again, so that appending costs constant time a byte.
std::size_t grown(std::size_t length) {
    const std::size_t generous = length * 2;
    return generous < HkString::npos ? generous : length;
}

/// Copies 1 to smallCapacity bytes without a call, by two pieces of a fixed size that may overlap.
void copyShort(char* to, const char* from, std::size_t length) {
    const auto copyEnds = [=](auto piece) {
        constexpr std::size_t size = decltype(piece)::value;
        char head[size];
        char tail[size];
        std::memcpy(head, from, size);
        std::memcpy(tail, from + length - size, size);
        std::memcpy(to, head, size);
        std::memcpy(to + length - size, tail, size);
    };
    if (length < 8) {
        if (length >= 4) {
            copyEnds(std::integral_constant<std::size_t, 4>());
        } else if (length >= 2) {
            copyEnds(std::integral_constant<std::size_t, 2>());
        } else {
            *to = *from;
        }
    } else if (length < 16) {
        copyEnds(std::integral_constant<std::size_t, 8>());
    } else {
        copyEnds(std::integral_constant<std::size_t, 16>());
    }
}

void addOwner(std::atomic<std::uint32_t>& owners) {
    if (platform::isSingleThreaded()) {
        owners.store(owners.load(std::memory_order_relaxed) + 1, std::memory_order_relaxed);
    } else {
        owners.fetch_add(1, std::memory_order_relaxed);
    }
}

/// Gives the number of owners left. A last owner has nobody to count against.
std::uint32_t removeOwner(std::atomic<std::uint32_t>& owners) {
    const std::uint32_t present = owners.load(std::memory_order_acquire);
    if (present == 1) {
        return 0;
    }
    if (platform::isSingleThreaded()) {
        owners.store(present - 1, std::memory_order_relaxed);
        return present - 1;
    }
    return owners.fetch_sub(1, std::memory_order_acq_rel) - 1;
}

std::uint32_t indexOrNone(std::size_t index) {
    return index != std::string_view::npos ? static_cast<std::uint32_t>(index) : HkString::npos;
}

}  // namespace

// A short text has a small block of its own, which costs less to copy than a count shared by threads; a long text is
// shared and counted. Which of both it is shows in its capacity.

HkString::EmptyText HkString::s_empty{{{0}, 0, {0}, 0}, ""};

/// A text of one owner whose content and length are not yet set.
char* HkString::newBlock(std::size_t capacity) {
    return capacity <= smallCapacity ? shortTextIn(SmallBlocks::take()) : newLongBlock(capacity);
}

char* HkString::newLongBlock(std::size_t capacity) {
    if (capacity >= npos) {
        throw std::length_error("HkString: the text would be too long");
    }
    void* const memory = ::operator new(headSize + capacity + 1);
    const auto room = static_cast<std::uint32_t>(capacity);
    return reinterpret_cast<char*>(new (memory) Head{{1}, room, {room}, 0} + 1);
}

char* HkString::shortTextIn(void* block) noexcept {
    static_assert(sizeof(Head) == headSize && offsetof(Head, length) == 12, "the length word is next to the text");
    return reinterpret_cast<char*>(new (block) Head{{1}, smallCapacity, {smallCapacity}, 0} + 1);
}

char* HkString::newText(std::string_view content) {
    if (content.size() > smallCapacity) {
        return newLongText(content);
    }
    if (content.empty()) {
        return emptyText();
    }
    char* const text = shortTextIn(SmallBlocks::take());
    copyShort(text, content.data(), content.size());
    setLength(text, content.size());
    return text;
}

char* HkString::newLongText(std::string_view content) {
    char* const text = newLongBlock(content.size());
    std::memcpy(text, content.data(), content.size());
    setLength(text, content.size());
    return text;
}

char* HkString::copiedText(char* text) {
    Head& head = headOf(text);
    if (head.capacity > smallCapacity) {
        head.room.store(0, std::memory_order_relaxed);
        addOwner(head.owners);
        return text;
    }
    if (text == emptyText()) {
        return text;
    }
    char* const copy = newBlock(smallCapacity);
    std::memcpy(copy, text, smallRoom);
    headOf(copy).length = head.length;
    return copy;
}

void HkString::releaseBlock(char* text) noexcept {
    Head& head = headOf(text);
    if (head.capacity == smallCapacity) {
        SmallBlocks::give(&head);
    } else if (removeOwner(head.owners) == 0) {
        ::operator delete(&head);
    }
}

/// True when the text is this string's alone and has room for @p length bytes. What was shared and is no more has its
/// room again.
bool HkString::hasRoom(std::size_t length) noexcept {
    Head& head = headOf(m_text);
    if (length > head.capacity || head.owners.load(std::memory_order_acquire) != 1) {
        return false;
    }
    head.room.store(head.capacity, std::memory_order_relaxed);
    return true;
}

void HkString::assign(std::string_view content) {
    if (!hasRoom(content.size())) {
        replaceText(newText(content));
        return;
    }
    std::memmove(m_text, content.data(), content.size());
    setLength(m_text, content.size());
}

void HkString::append(std::string_view content) {
    const std::size_t length = Length();
    if (!hasRoom(length + content.size())) {
        appendToNewBlock(content);
        return;
    }
    std::memcpy(m_text + length, content.data(), content.size());
    setLength(m_text, length + content.size());
}

/// The old text is released last: the content may be a piece of it.
void HkString::appendToNewBlock(std::string_view content) {
    if (content.empty()) {
        return;
    }
    const std::size_t length = Length();
    const std::size_t total = length + content.size();
    char* const text = newBlock(length != 0 ? grown(total) : total);
    std::memcpy(text, m_text, length);
    std::memcpy(text + length, content.data(), content.size());
    setLength(text, total);
    replaceText(text);
}

/// Makes the text this string's alone, with room for @p room bytes, at least those that it has.
void HkString::makeOwn(std::size_t room) {
    if (hasRoom(room)) {
        return;
    }
    const std::size_t length = Length();
    char* const text = newBlock(length < room ? grown(room) : length);
    std::memcpy(text, m_text, length);
    setLength(text, length);
    replaceText(text);
}

HkString& HkString::operator=(const HkString& other) {
    if (this != &other) {
        replaceText(copiedText(other.m_text));
    }
    return *this;
}

HkString& HkString::Format(const char* format, ...) {
    if (format == nullptr) {
        Empty();
        return *this;
    }
    char shortText[128];
    std::va_list arguments;
    std::va_list again;
    va_start(arguments, format);
    va_copy(again, arguments);
    const int written = std::vsnprintf(shortText, sizeof shortText, format, arguments);
    const std::size_t length = written > 0 ? static_cast<std::size_t>(written) : 0;
    if (length < sizeof shortText) {
        assign({shortText, length});
    } else {
        std::string longText(length, '\0');
        std::vsnprintf(longText.data(), length + 1, format, again);
        assign(longText);
    }
    va_end(again);
    va_end(arguments);
    return *this;
}

void HkString::Insert(std::uint32_t index, char ch, std::uint32_t count) {
    if (count == 0) {
        return;
    }
    const std::size_t length = Length();
    const std::size_t place = std::min<std::size_t>(index, length);
    makeOwn(length + count);
    std::memmove(m_text + place + count, m_text + place, length - place);
    std::memset(m_text + place, ch, count);
    setLength(m_text, length + count);
}

std::uint32_t HkString::GetIndexOfFirstChar(char ch, char second) const {
    const char wanted[] = {ch, second};
    return indexOrNone(view().find_first_of(std::string_view(wanted, second != '\0' ? 2 : 1)));
}

std::uint32_t HkString::GetIndexOfString(const char* text, CompareType mode) const {
    const std::string_view wanted = HkStr::View(text);
    if (mode == CompareExact) {
        return indexOrNone(view().find(wanted));
    }
    const std::string_view whole = view();
    const auto isSame = [](char a, char b) { return HkStr::ToLower(a) == HkStr::ToLower(b); };
    const auto found = std::search(whole.begin(), whole.end(), wanted.begin(), wanted.end(), isSame);
    const bool isThere = found != whole.end() || wanted.empty();
    return isThere ? static_cast<std::uint32_t>(found - whole.begin()) : npos;
}

void HkString::MakeUpper() {
    makeOwn(Length());
    std::transform(m_text, m_text + Length(), m_text, &HkStr::ToUpper);
}

void HkString::MakeLower() {
    makeOwn(Length());
    std::transform(m_text, m_text + Length(), m_text, &HkStr::ToLower);
}

}  // namespace HostKit
