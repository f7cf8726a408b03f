#include "../ChildProcess.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <stdexcept>
#include <thread>

namespace {

using Clock = std::chrono::steady_clock;
constexpr std::chrono::seconds patience{30};

}  // namespace

struct ChildProcess::Body {
    pid_t process = -1;
    int toChild = -1;
    int fromChild = -1;
    std::string received;
    int status = 0;
    bool ended = false;

    void start(std::vector<std::string> words);
    bool reap(int options);
    bool receive(Clock::time_point end);
    ~Body();
};

void ChildProcess::Body::start(std::vector<std::string> words) {
    int in[2];
    int out[2];
    if (::pipe2(in, O_CLOEXEC) != 0 || ::pipe2(out, O_CLOEXEC) != 0) {
        throw std::runtime_error("no pipe for a child");
    }
    toChild = in[1];
    fromChild = out[0];
    posix_spawn_file_actions_t actions;
    ::posix_spawn_file_actions_init(&actions);
    ::posix_spawn_file_actions_adddup2(&actions, in[0], STDIN_FILENO);
    ::posix_spawn_file_actions_adddup2(&actions, out[1], STDOUT_FILENO);
    std::vector<char*> argv;
    for (std::string& word : words) {
        argv.push_back(word.data());
    }
    argv.push_back(nullptr);
    const int error = ::posix_spawn(&process, "/proc/self/exe", &actions, nullptr, argv.data(), environ);
    ::posix_spawn_file_actions_destroy(&actions);
    ::close(in[0]);
    ::close(out[1]);
    if (error != 0) {
        throw std::runtime_error("cannot start a child");
    }
}

bool ChildProcess::Body::reap(int options) {
    ended = ended || ::waitpid(process, &status, options) == process;
    return ended;
}

bool ChildProcess::Body::receive(Clock::time_point end) {
    const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(end - Clock::now()).count();
    pollfd ready{fromChild, POLLIN, 0};
    char buffer[512];
    if (left <= 0 || ::poll(&ready, 1, static_cast<int>(left)) <= 0) {
        return false;
    }
    const ssize_t count = ::read(fromChild, buffer, sizeof buffer);
    received.append(buffer, count > 0 ? static_cast<std::size_t>(count) : 0);
    return count > 0;
}

ChildProcess::Body::~Body() {
    if (!ended) {
        ::kill(process, SIGKILL);
        reap(0);
    }
    ::close(toChild);
    ::close(fromChild);
}

ChildProcess::ChildProcess(const std::string& role, const std::vector<std::string>& arguments)
    : m_body(std::make_unique<Body>()) {
    std::vector<std::string> words{"child", "--role", role};
    words.insert(words.end(), arguments.begin(), arguments.end());
    ::signal(SIGPIPE, SIG_IGN);
    m_body->start(words);
}

ChildProcess::ChildProcess() = default;
ChildProcess::~ChildProcess() = default;
ChildProcess::ChildProcess(ChildProcess&&) noexcept = default;
ChildProcess& ChildProcess::operator=(ChildProcess&&) noexcept = default;

void ChildProcess::write(const std::string& line) {
    const std::string text = line + "\n";
    if (::write(m_body->toChild, text.data(), text.size()) < 0) {
        return;  // it has ended, as the next read tells
    }
}

std::string ChildProcess::read() {
    const auto end = Clock::now() + patience;
    std::size_t length = 0;
    while ((length = m_body->received.find('\n')) == std::string::npos) {
        if (!m_body->receive(end)) {
            return "(nothing)";
        }
    }
    const std::string line = m_body->received.substr(0, length);
    m_body->received.erase(0, length + 1);
    return line;
}

void ChildProcess::kill() {
    ::kill(m_body->process, SIGKILL);
    m_body->reap(0);
}

int ChildProcess::wait() {
    const auto end = Clock::now() + patience;
    while (!m_body->reap(WNOHANG)) {
        if (Clock::now() > end) {
            return -1;
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    return WIFEXITED(m_body->status) ? WEXITSTATUS(m_body->status) : -1;
}

long ChildProcess::id() const {
    return m_body->process;
}
