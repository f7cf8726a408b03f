// A second process of the test: the same program, started with a role (see Role.h), talked to line by line. A role has
// its time and ends then, and so every wait for it does. What is still alive at the end of the object is killed.
#pragma once

#include <memory>
#include <string>
#include <vector>

class ChildProcess {
public:
    /// Starts this program in @p role with these arguments; throws where that fails. Its standard input and output are
    /// ours.
    static std::unique_ptr<ChildProcess> start(const std::string& role, const std::vector<std::string>& arguments);
    virtual ~ChildProcess() = default;

    std::string ask(const std::string& line) {
        send(line + '\n');
        return read();
    }
    /// The child's next line without its end; empty where it has ended.
    virtual std::string read() = 0;
    /// Ends it at whatever instruction it is, without any clean-up, and waits until it is gone.
    virtual void kill() = 0;
    /// Waits for its end: its exit status, or -1 if it was killed.
    virtual int wait() = 0;

private:
    virtual void send(const std::string& text) = 0;
};
