#include "../ChildProcess.h"

#include <signal.h>
#include <spawn.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <stdexcept>

namespace {

struct PosixChild final : ChildProcess {
    pid_t process = -1;  ///< -1 behind its end
    int socket = -1;     ///< leads to the child's standard input and output
    int status = 0;

    explicit PosixChild(std::vector<std::string>& words) {
        int ends[2] = {-1, -1};
        ::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends);
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

    // Where the child has ended nothing is sent, as the next read tells.
    void send(const std::string& text) override { ::send(socket, text.data(), text.size(), MSG_NOSIGNAL); }

    std::string read() override {
        std::string line;
        for (char byte = 0; ::read(socket, &byte, 1) == 1 && byte != '\n';) {
            line += byte;
        }
        return line;
    }

    void kill() override {
        if (process != -1) {
            ::kill(process, SIGKILL);
            PosixChild::wait();
        }
    }

    int wait() override {
        if (process != -1) {
            ::waitpid(process, &status, 0);
            process = -1;
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
