#include "platform/NamedSemaphore.h"

#include <algorithm>
#include <chrono>
#include <cstring>
#include <memory>
#include <utility>

#include "platform/posix/CountSegment.h"
#include "platform/posix/ForkMark.h"
#include "platform/posix/NamedSemaphoreKeys.h"
#include "platform/posix/OpenFailure.h"
#include "platform/posix/OpeningLock.h"
#include "platform/posix/SystemV.h"

// How a semaphore comes, lives and goes:
//
// Opening, under the opening lock: attach the segment of the name's key, then ask the kernel how many are attached. If
// others are, it is a living semaphore. If not, it is what a dead process has left, and is set anew. The count of a
// living one is never touched by opening.
// Closing: detach; that alone ends the handle. Then, for tidiness, under the opening lock: remove the segment that
// nobody is attached to, and the lock itself.
//
// Every step may be the last one of its process. Before attaching nothing has happened; from attaching on the kernel
// knows of it; and what a process leaves that was killed before it could tidy up - a segment of one page without
// attachments, and a semaphore set - is used again by the next opener of the name and removed by its last closer.

struct PlatformSemaphore {
    Attachment attachment;
    key_t key = 0;       ///< of the segment
    key_t firstKey = 0;  ///< of the name, and of its opening lock
    std::uint64_t mark = 0;
};

namespace NamedSemaphore {
namespace {

using std::chrono::milliseconds;

constexpr milliseconds openingBound{2000};
constexpr milliseconds tidyingBound{500};

thread_local int failureCode = 0;

struct Birth {
    std::int32_t initial;
    std::int32_t maximum;
};

bool isUsable(const PlatformSemaphore* handle) {
    return handle != nullptr && ForkMark::isOwn(handle->mark);
}

bool isLegal(const char* name) {
    return name != nullptr && *name != '\0' && std::strlen(name) < CountSegment::nameSize;
}

PlatformSemaphore* refuse(int code, const char* words) {
    failureCode = code;
    OpenFailure::note(words);
    return nullptr;
}

PlatformSemaphore* makeHandle(Attachment&& attachment, key_t key, key_t firstKey) {
    auto handle = std::make_unique<PlatformSemaphore>();
    handle->attachment = std::move(attachment);
    handle->key = key;
    handle->firstKey = firstKey;
    const ForkMark::ForkPause pause;
    handle->mark = ForkMark::own();
    return handle.release();
}

bool isNamed(const CountSegment& segment, const char* name) {
    return segment.sign == CountSegment::ourSign && std::strncmp(segment.name, name, CountSegment::nameSize) == 0;
}

bool isOursOrNew(const CountSegment& segment) {
    return segment.sign == CountSegment::ourSign || segment.sign == 0;
}

/// The count as callers expect it; only a stranger's writing makes it negative.
std::int32_t readable(std::int32_t units) {
    return std::max(units, std::int32_t{0});
}

/// What the keys of a name hold.
struct Findings {
    Attachment living;     ///< attached if the semaphore lives
    key_t key = 0;         ///< where it lives or else may be made
    bool hasRoom = false;  ///< false where other names and programs have taken all keys
    bool failed = false;
};

Findings search(key_t firstKey, const char* name) {
    Findings findings;
    for (key_t i = 0; i < keysOfName; ++i) {
        const key_t key = firstKey + i;
        Attachment attachment;
        const Attachment::Outcome outcome = attachment.attachByKey(key);
        if (outcome == Attachment::Outcome::Failed) {
            findings.failed = true;
            return findings;
        }
        const bool attached = outcome == Attachment::Outcome::Attached;
        if (attached && !attachment.wasAlone() && isNamed(*attachment.segment(), name)) {
            findings.living = std::move(attachment);
            findings.key = key;
            return findings;
        }
        const bool isFree = outcome == Attachment::Outcome::Absent ||
                            (attached && attachment.wasAlone() && isOursOrNew(*attachment.segment()));
        if (isFree && !findings.hasRoom) {
            findings.hasRoom = true;
            findings.key = key;
        }
    }
    return findings;
}

/// Makes the segment or, where a dead process has left one, takes that over.
PlatformSemaphore* settle(key_t key, key_t firstKey, const char* name, const Birth& birth) {
    Attachment attachment;
    Attachment::Outcome outcome = attachment.make(key);
    if (outcome == Attachment::Outcome::Absent) {
        outcome = attachment.attachByKey(key);
    }
    if (outcome != Attachment::Outcome::Attached) {
        return nullptr;
    }
    if (!attachment.wasAlone()) {
        return refuse(notFound, "another program attached its segment just now");
    }
    attachment.set(name, birth.initial, birth.maximum);
    return makeHandle(std::move(attachment), key, firstKey);
}

/// A handle, or null, and whether the semaphore lived before.
struct Joined {
    PlatformSemaphore* handle = nullptr;
    bool wasThere = false;
};

/// Opens the semaphore, and gives birth to it where it does not live and @p birth is not null.
Joined join(const char* name, const Birth* birth) {
    const key_t firstKey = keyOfName(name);
    const auto whereAbsent = birth != nullptr ? OpeningLock::WhereAbsent::Make : OpeningLock::WhereAbsent::Give;
    const OpeningLock lock(firstKey, openingBound, whereAbsent);
    failureCode = notFound;
    if (!lock.isHeld()) {
        return {};
    }
    Findings findings = search(firstKey, name);
    if (findings.failed) {
        return {};
    }
    if (findings.living.segment() != nullptr) {
        return {makeHandle(std::move(findings.living), findings.key, firstKey), true};
    }
    if (birth == nullptr) {
        return {refuse(notFound, "there is none of this name")};
    }
    if (!findings.hasRoom) {
        return {refuse(notFound, "other segments have its keys, see ipcs -m")};
    }
    return {settle(findings.key, firstKey, name, *birth)};
}

/// Removes what nobody uses any more. Where another user owns it, or somebody stands still inside the lock, it stays
/// for the next opener.
void tidyUp(const PlatformSemaphore& closed) {
    OpeningLock lock(closed.firstKey, tidyingBound, OpeningLock::WhereAbsent::Give);
    if (!lock.isHeld()) {
        return;
    }
    const bool isRemoved = closed.attachment.removeIfIdle(closed.key);
    bool isNeeded = false;
    for (key_t i = 0; i < keysOfName && !isNeeded; ++i) {
        const key_t key = closed.firstKey + i;
        const bool isKnownFree = isRemoved && key == closed.key;  // who holds the lock alone makes segments
        isNeeded = !isKnownFree && SystemV::getSegment(key, 0, 0) != -1;
    }
    if (!isNeeded) {
        lock.remove();
    }
}

}  // namespace

PlatformSemaphore* open(const char* name) {
    return isLegal(name) ? join(name, nullptr).handle : refuse(invalidParameter, "its name is empty or too long");
}

PlatformSemaphore* create(const char* name, std::int32_t initial, std::int32_t maximum, bool* wasThere) {
    if (!isLegal(name)) {
        return refuse(invalidParameter, "its name is empty or too long");
    }
    if (initial < 0 || maximum <= 0 || initial > maximum) {
        return refuse(invalidParameter, "its counts are out of range");
    }
    const Birth birth{initial, maximum};
    const Joined joined = join(name, &birth);
    if (wasThere != nullptr) {
        *wasThere = joined.wasThere;
    }
    return joined.handle;
}

PlatformSemaphore* duplicate(PlatformSemaphore* handle) {
    if (!isUsable(handle)) {
        return refuse(invalidHandle, "there is no handle to duplicate in this process");
    }
    Attachment attachment;
    if (attachment.attachAgain(handle->attachment) != Attachment::Outcome::Attached) {
        failureCode = invalidHandle;
        return nullptr;
    }
    return makeHandle(std::move(attachment), handle->key, handle->firstKey);
}

std::uint32_t take(PlatformSemaphore* handle) {
    if (!isUsable(handle)) {
        failureCode = invalidHandle;
        return failed;
    }
    std::atomic<std::int32_t>& units = handle->attachment.segment()->count;
    std::int32_t seen = units.load(std::memory_order_relaxed);
    while (seen > 0) {
        if (units.compare_exchange_weak(seen, seen - 1, std::memory_order_acquire, std::memory_order_relaxed)) {
            return taken;
        }
    }
    return timedOut;
}

bool release(PlatformSemaphore* handle, std::int32_t units, std::int32_t* previous) {
    if (!isUsable(handle)) {
        failureCode = invalidHandle;
        return false;
    }
    if (units <= 0) {
        failureCode = invalidParameter;
        return false;
    }
    CountSegment& segment = *handle->attachment.segment();
    std::int32_t seen = segment.count.load(std::memory_order_relaxed);
    do {
        if (std::int64_t{seen} + units > segment.maximum) {
            failureCode = tooManyUnits;
            return false;
        }
    } while (
        !segment.count.compare_exchange_weak(seen, seen + units, std::memory_order_release, std::memory_order_relaxed));
    if (previous != nullptr) {
        *previous = readable(seen);
    }
    return true;
}

bool count(PlatformSemaphore* handle, std::int32_t& value) {
    if (!isUsable(handle)) {
        failureCode = invalidHandle;
        return false;
    }
    value = readable(handle->attachment.segment()->count.load(std::memory_order_relaxed));
    return true;
}

void close(PlatformSemaphore* handle) {
    const std::unique_ptr<PlatformSemaphore> owner(handle);
    if (!isUsable(handle)) {
        if (handle != nullptr) {
            handle->attachment.forget();
        }
        return;
    }
    handle->attachment.detach();
    tidyUp(*handle);
}

int lastError() {
    return failureCode;
}

const char* explainLastError() {
    return OpenFailure::words();
}

}  // namespace NamedSemaphore
