// What a test does in a forked child.
#pragma once

#include <grp.h>
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

/// Turns this process into one of a user without privileges; false where it may not.
inline bool becomeAnotherUser() {
    return ::setgroups(0, nullptr) + ::setgid(65534) + ::setuid(65534) == 0;
}
