// What only a real process on a POSIX host can suffer: kills, stops, signals, forks, leaks, foreign files and users.

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <future>
#include <iterator>
#include <string>
#include <vector>

#include "MessageRecorder.h"
#include "host/posix/Forked.h"
#include "tests/transport/Links.h"

namespace {

using testing::ElementsAre;

std::string pathOf(const char* name) {
    return "/tmp/tessal_" + std::string(name) + std::to_string(::getpid());
}

/// A child that runs the body and then waits to be killed, and is killed at the end.
class Child {
public:
    template <class Body>
    explicit Child(Body body) : m_process(::fork()) {
        if (m_process == 0) {
            body();
            ::raise(SIGSTOP);  // which tells that the body is done
            ::pause();
        }
        int status = 0;
        EXPECT_EQ(::waitpid(m_process, &status, WUNTRACED), m_process);
        EXPECT_TRUE(WIFSTOPPED(status));
    }
    ~Child() { kill(); }
    Child(const Child&) = delete;
    Child& operator=(const Child&) = delete;

    void goOn() const { ::kill(m_process, SIGCONT); }
    void kill() {
        if (m_process > 0) {
            ::kill(m_process, SIGKILL);
            ::waitpid(m_process, nullptr, 0);
            m_process = -1;
        }
    }

private:
    pid_t m_process;
};

auto openDescriptors() {
    return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
}

bool isThere(const std::string& path) {
    return ::access(path.c_str(), F_OK) == 0;
}

/// A client reaches this server and no other.
void expectServed(TessalPipe& server, const std::string& name) {
    TessalPipe client(1, name.c_str());
    EXPECT_TRUE(client.initialize());
    EXPECT_TRUE(server.waitForClient());
}

TEST(TransportFaults, AResetIsAFailure) {
    int port = 0;
    const std::unique_ptr<TessalSocket> server = listeningServer(port);
    TessalSocket client(1, "127.0.0.1", port);
    ASSERT_TRUE(client.initialize());
    const TessalSocket::Socket accepted = server->acceptClient(nullptr, nullptr);
    const linger atOnce{1, 0};
    ::setsockopt(static_cast<int>(accepted), SOL_SOCKET, SO_LINGER, &atOnce, sizeof atOnce);
    server->closeSocket(accepted);
    const MessageRecorder messages;
    char byte = 0;
    EXPECT_FALSE(client.readSocket(&byte, 1));
    EXPECT_THAT(messages.status(), ElementsAre(" recv() failed: 104\n"));
}

template <class LinkType>
void waitForAStoppedPeer() {
    LinkType link;
    Child child([&link] {
        link.client.write("\4\3", 2);
        ::raise(SIGSTOP);
        link.client.write("\2\1", 2);
    });
    const MessageRecorder messages;
    int value = 0;
    std::future<void> reading = std::async(std::launch::async, [&] { link.server.readInt(&value); });
    EXPECT_EQ(reading.wait_for(std::chrono::milliseconds(100)), std::future_status::timeout) << "half a number";
    child.goOn();
    reading.wait();
    EXPECT_EQ(value, 0x01020304);
    EXPECT_THAT(messages.status(), testing::IsEmpty());
}

TEST(TransportFaults, AStoppedPeerIsWaitedForAndGoesOn) {
    waitForAStoppedPeer<SocketLink>();
    waitForAStoppedPeer<PipeLink>();
}

TEST(TransportFaults, APipeNameIsFreeBehindAKilledServerAndAForkedChild) {
    const std::string name = pathOf("killed_");
    Child child([&name] {
        static TessalPipe server(0, name.c_str());
        server.initialize();
    });
    EXPECT_TRUE(isThere(name));
    TessalPipe second(0, name.c_str());
    EXPECT_TRUE(second.initialize());
    EXPECT_FALSE(second.waitForClient()) << "the child lives, so nothing was created";
    child.kill();
    EXPECT_TRUE(isThere(name)) << "the socket file is left";
    TessalPipe third(0, name.c_str());
    EXPECT_TRUE(third.initialize());
    expectServed(third, name);
    const Child forked([] {});
    third.deinitialize();
    EXPECT_FALSE(isThere(name) || isThere(name + ".lock"));
    TessalPipe fourth(0, name.c_str());
    EXPECT_TRUE(fourth.initialize());
    expectServed(fourth, name);  // not the child's copy of the old one
}

TEST(TransportFaults, OnlyTheOwnerMayConnectAndForeignFilesStay) {
    const std::string name = pathOf("mode_");
    const mode_t former = ::umask(0);
    TessalPipe server(0, name.c_str());
    ASSERT_TRUE(server.initialize());
    ::umask(former);
    struct stat status {};
    ASSERT_EQ(::stat(name.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777U, 0600U);
    server.deinitialize();

    std::ofstream(name) << "precious";
    TessalPipe onFile(0, name.c_str());
    EXPECT_FALSE(onFile.initialize());
    std::string content;
    std::ifstream(name) >> content;
    EXPECT_EQ(content, "precious");
    ::unlink(name.c_str());
    EXPECT_FALSE(TessalPipe(0, ("/tmp/" + std::string(100, 'z')).c_str()).initialize()) << "too long for a socket";
}

TEST(TransportFaults, AnotherUsersPipeIsNeitherReachedNorTaken) {
    if (inChild([] { return becomeAnotherUser() ? 0 : 1; }) != 0) {
        GTEST_SKIP() << "needs the right to become another user";
    }
    const std::string name = pathOf("owned_");
    const auto expectRefused = [&name](int role) {
        const auto attempt = [&] {
            return becomeAnotherUser() && !TessalPipe(role, name.c_str()).initialize() ? 0 : 1;
        };
        EXPECT_EQ(inChild(attempt), 0) << role;
    };
    TessalPipe server(0, name.c_str());
    ASSERT_TRUE(server.initialize());
    expectRefused(1);
    expectRefused(0);
    expectServed(server, name);
    server.deinitialize();
    {
        const Child killed([&name] {
            static TessalPipe left(0, name.c_str());
            left.initialize();
        });
    }
    expectRefused(0);  // the file that a killed server left is its user's
    EXPECT_TRUE(isThere(name));
    EXPECT_TRUE(server.initialize());
    server.deinitialize();
}

TEST(TransportFaults, SignalsBreakNoTransfer) {
    struct sigaction action {};
    action.sa_handler = [](int) {};
    struct sigaction former {};
    ::sigaction(SIGALRM, &action, &former);
    const itimerval storm{{0, 500}, {0, 500}};
    ::setitimer(ITIMER_REAL, &storm, nullptr);
    SocketLink socket;
    PipeLink pipe;
    expectEcho(socket);
    expectEcho(pipe);
    const itimerval quiet{};
    ::setitimer(ITIMER_REAL, &quiet, nullptr);
    ::sigaction(SIGALRM, &former, nullptr);
}

TEST(TransportFaults, NoDescriptorLeaksAndNoneIsInherited) {
    { const PipeLink first; }  // now what stays open for good is open
    const MessageRecorder messages;
    const auto before = openDescriptors();
    for (int i = 0; i < 20; ++i) {
        const SocketLink socket;
        const PipeLink pipe;
        for (int number = 3; number < 64; ++number) {
            const int flags = ::fcntl(number, F_GETFD);
            struct stat status {};
            const bool isSocket = flags >= 0 && ::fstat(number, &status) == 0 && S_ISSOCK(status.st_mode);
            EXPECT_TRUE(!isSocket || (flags & FD_CLOEXEC) != 0) << number;
        }
        TessalPipe(1, "/tmp/no_such_pipe").initialize();
        TessalPipe(0, "/no/such/directory/pipe").initialize();
        TessalSocket(1, "127.0.0.1", 1).connectToServer();
    }
    EXPECT_EQ(openDescriptors(), before);
}

TEST(TransportFaults, ADescriptorLimitIsAFailureWithAMessage) {
    const auto opened = [] {
        const bool hasSocket = TessalSocket(0, "", freshPort()).initialize();
        const bool hasPipe = TessalPipe(0, freshPipeName().c_str()).initialize();
        return (hasSocket ? 1 : 0) + (hasPipe ? 1 : 0);
    };
    // Here, too, for sanitizers look at an object of a new class through a pipe, which the child cannot make.
    EXPECT_EQ(opened(), 2);
    const int status = inChild([&] {
        const auto used = static_cast<rlim_t>(::open("/dev/null", O_RDONLY | O_CLOEXEC));
        const rlimit tight{used + 1, used + 1};
        ::setrlimit(RLIMIT_NOFILE, &tight);
        const MessageRecorder messages;
        const bool isTold = opened() == 0 && messages.status() == std::vector<std::string>{" socket() failed: 24\n"};
        return isTold ? 0 : 1;
    });
    EXPECT_EQ(status, 0);
}

}  // namespace
