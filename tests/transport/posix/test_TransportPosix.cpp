// What only a real process on a POSIX host can suffer: kills, signals, forks, leaks, foreign files and users.

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <fstream>
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
    SocketLink link;
    link.client.writeBool(true);
    link.closeServerEnd();  // with a byte that nobody has read
    const MessageRecorder messages;
    char byte = 0;
    EXPECT_FALSE(link.client.read(&byte, 1));
    EXPECT_THAT(messages.status(), ElementsAre(" recv() failed: 104\n"));
}

TEST(TransportFaults, APipeNameIsFreeBehindAKilledServerWhoseForkedChildLives) {
    const std::string name = pathOf("killed_");
    const Orphan child([&name] {
        static TessalPipe server(0, name.c_str());
        return server.initialize();
    });
    EXPECT_TRUE(isThere(name)) << "the socket file is left";
    TessalPipe second(0, name.c_str());
    EXPECT_TRUE(second.initialize());
    expectServed(second, name);  // not the child's copy of the old one
    second.deinitialize();
    EXPECT_FALSE(isThere(name) || isThere(name + ".lock"));
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
    inChild([&name] {
        static TessalPipe killed(0, name.c_str());
        return killed.initialize() ? ::raise(SIGKILL) : 1;
    });
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
            struct stat status {};
            const bool isSocket = ::fstat(number, &status) == 0 && S_ISSOCK(status.st_mode);
            EXPECT_TRUE(!isSocket || (::fcntl(number, F_GETFD) & FD_CLOEXEC) != 0) << number;
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
