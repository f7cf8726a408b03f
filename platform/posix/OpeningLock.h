// The lock under which the semaphores of one key come to be and go, among all processes of the machine.
//
// It is a System V semaphore, held while it is 1. It is taken by one atomic call (wait for 0, add 1, undo at death), so
// that it needs no initial value, is free again when its holder is killed at any instruction, and can be waited for
// with a bound. Its holder may remove the set altogether: those who wait for it then start over.
//
// The kernel detaches a dying process's memory before it undoes its semaphore operations. So whoever gets the lock
// behind a killed holder counts none of its attachments any more.
#pragma once

#include <sys/types.h>

#include <chrono>

class OpeningLock {
public:
    enum class WhereAbsent { Give, Make };

    /// Takes the lock of @p key, waiting @p bound at most. Where no set is there, makes one or gives it up.
    OpeningLock(key_t key, std::chrono::milliseconds bound, WhereAbsent whereAbsent);
    ~OpeningLock();
    OpeningLock(const OpeningLock&) = delete;
    OpeningLock& operator=(const OpeningLock&) = delete;

    bool isHeld() const { return m_set != none; }

    /// Removes the set, which lets go of the lock too; where that is another user's right, only lets go.
    void remove();

private:
    enum class Step { Held, Again, GivenUp };

    Step tryOnce(key_t key, std::chrono::milliseconds left, WhereAbsent whereAbsent);
    void letGo() const;

    static constexpr int none = -1;  // 0 is an identifier like any other

    int m_set = none;
};
