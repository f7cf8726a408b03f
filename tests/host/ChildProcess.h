// A second process of the test: the same program, started with a role (see Role.h), talked to line by line. Every wait
// has a bound; what is still alive at the end of the object is killed.
#pragma once

#include <memory>
#include <string>
#include <vector>

struct HostChild;

class ChildProcess {
public:
    /// No process; only to be assigned to.
    ChildProcess();
    /// Starts this program in @p role with these arguments. Its standard input and output are ours.
    ChildProcess(const std::string& role, const std::vector<std::string>& arguments);
    ~ChildProcess();
    ChildProcess(ChildProcess&&) noexcept;
    ChildProcess& operator=(ChildProcess&&) noexcept;

    void write(const std::string& line);
    /// The child's next line without its end; "(nothing)" where none comes in time or the child has ended.
    std::string read();
    std::string ask(const std::string& line) {
        write(line);
        return read();
    }

    /// Ends it at whatever instruction it is, without any clean-up, and waits until it is gone.
    void kill();
    /// Waits for its end: its exit status, or -1 if it was killed or does not end in time.
    int wait();

    /// The host's number of the process.
    long id() const;

private:
    std::unique_ptr<HostChild> m_child;
    std::string m_received;
};
