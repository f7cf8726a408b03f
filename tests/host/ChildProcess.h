// A second process of the test: the same program, started with a role (see Role.h), talked to line by line. Every wait
// has a bound; what is still alive at the end of the object is killed.
#pragma once

#include <chrono>
#include <memory>
#include <string>
#include <vector>

class ChildProcess {
public:
    /// Starts this program in @p role with these arguments; throws where that fails. Its standard input and output are
    /// ours.
    static std::unique_ptr<ChildProcess> start(const std::string& role, const std::vector<std::string>& arguments);
    virtual ~ChildProcess() = default;

    void write(const std::string& line) { send(line + "\n"); }
    /// The child's next line without its end; "(nothing)" where none comes in time or the child has ended.
    std::string read();
    std::string ask(const std::string& line) {
        write(line);
        return read();
    }

    /// Ends it at whatever instruction it is, without any clean-up, and waits until it is gone.
    virtual void kill() = 0;
    /// Waits for its end: its exit status, or -1 if it was killed or does not end in time.
    virtual int wait() = 0;

protected:
    using Clock = std::chrono::steady_clock;
    static constexpr std::chrono::seconds patience{60};

private:
    virtual void send(const std::string& text) = 0;
    /// Adds what has come; false where nothing comes until @p end or the child has ended.
    virtual bool receive(std::string& received, Clock::time_point end) = 0;

    std::string m_received;
};
