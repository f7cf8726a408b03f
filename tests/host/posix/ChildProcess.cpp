#include "../ChildProcess.h"

#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <stdexcept>
#include <thread>

namespace {

struct PosixChild final : ChildProcess {
    pid_t process = -1;
    int socket = -1;  ///< leads to the child's standard input and output
    int status = 0;
    bool ended = false;

    explicit PosixChild(std::vector<std::string>& words) {
        int ends[2];
        if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends) != 0) {
            throw std::runtime_error("no sockets for a child");
        }
        socket = ends[0];
        posix_spawn_file_actions_t actions;
        ::posix_spawn_file_actions_init(&actions);
        ::posix_spawn_file_actions_adddup2(&actions, ends[1], STDIN_FILENO);
        ::posix_spawn_file_actions_adddup2(&actions, ends[1], STDOUT_FILENO);
        std::vector<char*> argv;
        for (std::string& word : words) {
            argv.push_back(word.data());
        }
        argv.push_back(nullptr);
        const int error = ::posix_spawn(&process, "/proc/self/exe", &actions, nullptr, argv.data(), environ);
        ::posix_spawn_file_actions_destroy(&actions);
        ::close(ends[1]);
        if (error != 0) {
            throw std::runtime_error("cannot start a child");
        }
    }

    ~PosixChild() override {
        PosixChild::kill();
        ::close(socket);
    }

    bool reap(int options) {
        ended = ended || ::waitpid(process, &status, options) == process;
        return ended;
    }

    // Where the child has ended nothing is sent, as the next read tells.
    void send(const std::string& text) override { ::send(socket, text.data(), text.size(), MSG_NOSIGNAL); }

    bool receive(std::string& received, Clock::time_point end) override {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(end - Clock::now()).count();
        pollfd ready{socket, POLLIN, 0};
        char buffer[512];
        if (left <= 0 || ::poll(&ready, 1, static_cast<int>(left)) <= 0) {
            return false;
        }
        const ssize_t count = ::read(socket, buffer, sizeof buffer);
        received.append(buffer, count > 0 ? static_cast<std::size_t>(count) : 0);
        return count > 0;
    }

    void kill() override {
        if (!ended) {
            ::kill(process, SIGKILL);
            reap(0);
        }
    }

    int wait() override {
        const auto end = Clock::now() + patience;
        while (!reap(WNOHANG)) {
            if (Clock::now() > end) {
                return -1;
            }
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }
};

}  // namespace

std::unique_ptr<ChildProcess> ChildProcess::start(const std::string& role, const std::vector<std::string>& arguments) {
    std::vector<std::string> words{"child", "--role", role};
    words.insert(words.end(), arguments.begin(), arguments.end());
    return std::make_unique<PosixChild>(words);
}
