#include "platform/posix/CountSegment.h"

#include <cerrno>
#include <cstring>
#include <utility>

#include "platform/posix/ForkMark.h"
#include "platform/posix/OpenFailure.h"
#include "platform/posix/SystemV.h"

namespace {

Attachment::Outcome outcomeOf(int error) {
    switch (error) {
        case ENOENT:
        case EEXIST:
        case EIDRM:
        case EINVAL:  // an identifier whose segment has gone
            return Attachment::Outcome::Absent;
        case EACCES:
            return Attachment::Outcome::NotOurs;
        default:
            return Attachment::Outcome::Failed;
    }
}

Attachment::Outcome failure() {
    const int error = errno;
    OpenFailure::noteHostCall();
    return outcomeOf(error);
}

}  // namespace

Attachment::Attachment(Attachment&& other) noexcept
    : m_segment(std::exchange(other.m_segment, nullptr)), m_identifier(other.m_identifier), m_alone(other.m_alone) {}

Attachment& Attachment::operator=(Attachment&& other) noexcept {
    std::swap(m_segment, other.m_segment);
    std::swap(m_identifier, other.m_identifier);
    std::swap(m_alone, other.m_alone);
    return *this;
}

Attachment::Outcome Attachment::attachByKey(key_t key) {
    const int identifier = SystemV::getSegment(key, 0, 0);
    return identifier == -1 ? failure() : attach(identifier);
}

Attachment::Outcome Attachment::make(key_t key) {
    const int identifier = SystemV::getSegment(key, sizeof(CountSegment), IPC_CREAT | IPC_EXCL | SystemV::everyone);
    return identifier == -1 ? failure() : attach(identifier);
}

Attachment::Outcome Attachment::attachAgain(const Attachment& other) {
    return attach(other.m_identifier);
}

// A segment of another size is no segment of ours. It must not be marked either: marking a part of it would divide its
// mapping, and the kernel would count both parts.
Attachment::Outcome Attachment::attach(int identifier) {
    const ForkMark::ForkPause pause;
    void* const address = SystemV::attach(identifier);
    if (address == nullptr) {
        return failure();
    }
    m_segment = static_cast<CountSegment*>(address);
    m_identifier = identifier;
    shmid_ds state{};
    if (SystemV::inspectSegment(identifier, state) == -1) {
        const Outcome outcome = failure();
        detach();
        return outcome;
    }
    if (state.shm_segsz != sizeof(CountSegment) || (state.shm_perm.mode & SHM_DEST) != 0) {
        detach();
        OpenFailure::note("another program's segment has its key, or it was removed, see ipcs -m");
        return Outcome::NotOurs;
    }
    if (SystemV::keepFromChildren(address, sizeof(CountSegment)) == -1) {
        OpenFailure::noteHostCall();
        detach();
        return Outcome::Failed;
    }
    m_alone = state.shm_nattch == 1;
    return Outcome::Attached;
}

void Attachment::detach() {
    if (m_segment != nullptr) {
        SystemV::detach(std::exchange(m_segment, nullptr));
    }
}

void Attachment::set(const char* name, std::int32_t initial, std::int32_t maximum) const {
    std::memcpy(m_segment->name, name, std::strlen(name) + 1);  // it fits: NamedSemaphore takes no longer one
    m_segment->maximum = maximum;
    m_segment->count.store(initial, std::memory_order_relaxed);
    m_segment->sign = CountSegment::ourSign;
}

bool Attachment::removeIfIdle(key_t key) const {
    shmid_ds state{};
    return SystemV::inspectSegment(m_identifier, state) == 0 && state.shm_perm.__key == key && state.shm_nattch == 0 &&
           SystemV::removeSegment(m_identifier) == 0;
}
