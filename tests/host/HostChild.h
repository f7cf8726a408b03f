// What the host does for a ChildProcess.
#pragma once

#include <chrono>
#include <memory>
#include <string>
#include <vector>

struct HostChild {
    using Clock = std::chrono::steady_clock;
    static constexpr std::chrono::seconds patience{60};

    /// Starts this program with these words; throws where that fails.
    static std::unique_ptr<HostChild> start(std::vector<std::string> words);
    /// Kills what is still alive.
    virtual ~HostChild() = default;

    virtual void send(const std::string& text) = 0;
    /// Adds what has come; false where nothing comes until @p end or the child has ended.
    virtual bool receive(std::string& received, Clock::time_point end) = 0;
    virtual void kill() = 0;
    virtual int wait() = 0;
    virtual long id() const = 0;
};
