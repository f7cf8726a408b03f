// The shared memory of one semaphore, and one attachment of it, which is what a handle is made of.
//
// The kernel counts the attachments of a segment and takes those of a dead process or of an executed program off by
// itself. So a semaphore lives while its segment is attached, and a segment that nobody was attached to is nobody's.
#pragma once

#include <sys/types.h>

#include <atomic>
#include <cstddef>
#include <cstdint>

/// What lies in the segment. New segments come zeroed from the kernel; but for the count, nothing in a set one changes
/// while it is attached.
struct CountSegment {
    static constexpr std::uint32_t ourSign = 0x53544E43;
    static constexpr std::size_t nameSize = 260;

    std::atomic<std::int32_t> count;
    std::int32_t maximum;
    std::uint32_t sign;
    char name[nameSize];
};
static_assert(std::atomic<std::int32_t>::is_always_lock_free, "The count is shared between processes.");

class Attachment {
public:
    Attachment() = default;
    Attachment(Attachment&& other) noexcept;
    Attachment& operator=(Attachment&& other) noexcept;
    ~Attachment() { detach(); }

    enum class Outcome { Attached, Absent, NotOurs, Failed };

    /// Attaches the segment of @p key, if it may be one of ours.
    Outcome attachByKey(key_t key);

    /// Makes the segment of @p key, where there is none, and attaches it.
    Outcome make(key_t key);

    /// Attaches the segment of @p other, which is attached, once more.
    Outcome attachAgain(const Attachment& other);

    void detach();

    /// Forgets an attachment that is none in this process: the memory was not inherited.
    void forget() { m_segment = nullptr; }

    CountSegment* segment() const { return m_segment; }

    /// True if, at the time of attaching, nothing else was attached. Under the opening lock it stays true.
    bool wasAlone() const { return m_alone; }

    /// Fits the segment out for @p name.
    void set(const char* name, std::int32_t initial, std::int32_t maximum) const;

    /// Removes the segment that this was an attachment of, if it is still that of @p key and nobody is attached: true
    /// if removed. For use under the opening lock.
    bool removeIfIdle(key_t key) const;

private:
    Outcome attach(int identifier);

    CountSegment* m_segment = nullptr;
    int m_identifier = -1;
    bool m_alone = false;
};
