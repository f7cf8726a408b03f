// What a test does in forked children.
#pragma once

#include <grp.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

/// Runs the body in a forked child and gives its exit status, -1 if it ended by a signal.
template <class Body>
int inChild(Body body) {
    const pid_t child = ::fork();
    if (child == 0) {
        ::_exit(body());
    }
    int status = 0;
    ::waitpid(child, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

/// A child that is killed when it has run the body, which must give true, and what it forked then, which lives, or
/// executes another program, until the end of the object.
class Orphan {
public:
    template <class Body>
    explicit Orphan(Body body, bool executes = false) {
        EXPECT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, m_ends), 0);
        const auto forkAndDie = [&] {
            char byte = 0;
            if (!body()) {
                return 1;
            }
            if (::fork() != 0) {
                ::recv(m_ends[0], &byte, 1, 0);
                return ::raise(SIGKILL);
            }
            ::send(m_ends[1], &byte, 1, 0);  // the fork is over on this side too
            ::dup2(m_ends[1], STDIN_FILENO);
            ::close(m_ends[0]);
            return executes ? ::execlp("cat", "cat", nullptr) : static_cast<int>(::recv(STDIN_FILENO, &byte, 1, 0));
        };
        EXPECT_EQ(inChild(forkAndDie), -1);
    }
    ~Orphan() {
        ::close(m_ends[0]);
        ::close(m_ends[1]);
    }
    Orphan(const Orphan&) = delete;
    Orphan& operator=(const Orphan&) = delete;

private:
    int m_ends[2]{};  ///< of a connection whose end is the orphan's
};

/// Turns this process into one of a user without privileges; false where it may not.
inline bool becomeAnotherUser() {
    return ::setgroups(0, nullptr) + ::setgid(65534) + ::setuid(65534) == 0;
}
