// The kernel's System V calls as the named semaphores need them. Each asks the filter first, which tests set to count
// the steps, to let a call fail, or to end or stop the process there.
#pragma once

#include <sys/ipc.h>
#include <sys/mman.h>
#include <sys/sem.h>
#include <sys/shm.h>

#include <cstddef>
#include <ctime>

namespace SystemV {

/// Gets the name of the call about to be made; false lets it fail with the errno that the filter has set.
using Filter = bool (*)(const char* call);
extern Filter filter;

/// Name of the last call that was made or refused in this thread.
extern thread_local const char* lastCall;

/// Objects serve every user of the machine; the umask does not touch them.
constexpr int everyone = 0666;

inline bool allows(const char* call) {
    lastCall = call;
    return filter == nullptr || filter(call);
}

inline int getSegment(key_t key, std::size_t size, int flags) {
    return allows("shmget") ? ::shmget(key, size, flags) : -1;
}

/// Null on failure.
inline void* attach(int segment) {
    void* const address = allows("shmat") ? ::shmat(segment, nullptr, 0) : MAP_FAILED;
    return address == MAP_FAILED ? nullptr : address;  // both calls fail with the same value
}

inline int detach(const void* address) {
    return allows("shmdt") ? ::shmdt(address) : -1;
}

inline int inspectSegment(int segment, shmid_ds& state) {
    return allows("shmctl(IPC_STAT)") ? ::shmctl(segment, IPC_STAT, &state) : -1;
}

inline int removeSegment(int segment) {
    return allows("shmctl(IPC_RMID)") ? ::shmctl(segment, IPC_RMID, nullptr) : -1;
}

/// Keeps the memory out of forked children.
inline int keepFromChildren(void* address, std::size_t size) {
    return allows("madvise") ? ::madvise(address, size, MADV_DONTFORK) : -1;
}

inline int getSet(key_t key, int count, int flags) {
    return allows("semget") ? ::semget(key, count, flags) : -1;
}

/// All operations at once or, when the bound has passed, none of them.
inline int operate(int set, sembuf* operations, std::size_t count, const timespec& bound) {
    return allows("semtimedop") ? ::semtimedop(set, operations, count, &bound) : -1;
}

/// One operation that does not wait.
inline int operateAtOnce(int set, sembuf& operation) {
    return allows("semop") ? ::semop(set, &operation, 1) : -1;
}

inline int inspectSet(int set, semid_ds& state) {
    return allows("semctl(IPC_STAT)") ? ::semctl(set, 0, IPC_STAT, &state) : -1;
}

inline int removeSet(int set) {
    return allows("semctl(IPC_RMID)") ? ::semctl(set, 0, IPC_RMID) : -1;
}

/// The process that used the first semaphore of the set last.
inline int lastUser(int set) {
    return allows("semctl(GETPID)") ? ::semctl(set, 0, GETPID) : -1;
}

}  // namespace SystemV
