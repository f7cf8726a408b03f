// What only a real process on a POSIX host can suffer: kills, signals, forks, leaks, foreign files.

#if !defined(_WIN32)

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>

#include "MessageRecorder.h"
#include "tests/transport/Links.h"

namespace {

using testing::ElementsAre;

std::string pathIn(const char* directory, const char* name) {
    return std::string(directory) + '/' + name + std::to_string(::getpid());
}

/// A child that runs the body and then waits to be killed; it tells by a byte that the body is done.
template <class Body>
pid_t startChild(Body body) {
    int ready[2];
    if (::pipe2(ready, O_CLOEXEC) != 0) {
        return -1;
    }
    const pid_t child = ::fork();
    if (child == 0) {
        body();
        while (::write(ready[1], "x", 1) == 1) {
            ::pause();
        }
        ::_exit(0);
    }
    ::close(ready[1]);
    char byte = 0;
    EXPECT_EQ(::read(ready[0], &byte, 1), 1);
    ::close(ready[0]);
    return child;
}

void kill(pid_t child) {
    ::kill(child, SIGKILL);
    ::waitpid(child, nullptr, 0);
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

TEST(TransportFaults, APeerKilledInTheMiddleOfAFieldAndAResetAreFailures) {
    int port = 0;
    const std::unique_ptr<TessalSocket> server = listeningServer(port);
    ASSERT_NE(server, nullptr);
    const pid_t child = startChild([port] {
        static TessalSocket client(1, "127.0.0.1", port);
        client.initialize();
        client.writeSocket("\1\2", 2);
    });
    TessalSocket::Socket accepted = server->acceptClient(nullptr, nullptr);
    kill(child);
    MessageRecorder messages;
    int value = 9;
    EXPECT_EQ(server->readInt(accepted, &value), 4);
    EXPECT_EQ(messages.status().size(), 1U);
    server->closeSocket(accepted);

    TessalSocket client(1, "127.0.0.1", port);
    ASSERT_TRUE(client.initialize());
    accepted = server->acceptClient(nullptr, nullptr);
    const linger atOnce{1, 0};
    ::setsockopt(static_cast<int>(accepted), SOL_SOCKET, SO_LINGER, &atOnce, sizeof atOnce);
    server->closeSocket(accepted);
    messages.clear();
    char byte = 0;
    EXPECT_FALSE(client.readSocket(&byte, 1));
    EXPECT_THAT(messages.status(), ElementsAre(" recv() failed: 104\n"));
}

TEST(TransportFaults, AKilledServersPipeIsFreeAtOnce) {
    const std::string name = pathIn("/tmp", "tessal_killed_");
    const pid_t child = startChild([&name] {
        static TessalPipe server(0, name.c_str());
        server.initialize();
    });
    EXPECT_TRUE(isThere(name));
    TessalPipe second(0, name.c_str());
    EXPECT_TRUE(second.initialize());
    EXPECT_FALSE(second.waitForClient()) << "the child lives, so nothing was created";
    kill(child);
    EXPECT_TRUE(isThere(name)) << "the socket file is left";
    TessalPipe third(0, name.c_str());
    EXPECT_TRUE(third.initialize());
    expectServed(third, name);
    third.deinitialize();
    EXPECT_FALSE(isThere(name) || isThere(name + ".lock"));
}

TEST(TransportFaults, AForkedChildDoesNotKeepTheNameTaken) {
    const std::string name = pathIn("/tmp", "tessal_forked_");
    auto server = std::make_unique<TessalPipe>(0, name.c_str());
    ASSERT_TRUE(server->initialize());
    const pid_t child = startChild([] {});
    server->deinitialize();
    TessalPipe next(0, name.c_str());
    EXPECT_TRUE(next.initialize());
    expectServed(next, name);  // not the child's copy of the old one
    kill(child);
}

TEST(TransportFaults, OnlyTheOwnerMayConnectAndForeignFilesStay) {
    const std::string name = pathIn("/tmp", "tessal_mode_");
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

TEST(TransportFaults, SignalsBreakNoTransfer) {
    struct sigaction action {};
    action.sa_handler = [](int) {};
    struct sigaction former {};
    ::sigaction(SIGALRM, &action, &former);
    const itimerval storm{{0, 500}, {0, 500}};
    ::setitimer(ITIMER_REAL, &storm, nullptr);
    const auto transfer = [](Link&& link) {
        ASSERT_TRUE(link.connect());
        std::string block(std::size_t{4} << 20, 'x');
        std::thread reader([&] {
            std::string back(block.size(), '?');
            EXPECT_TRUE(link.server.read(back.data(), static_cast<int>(back.size())));
            EXPECT_EQ(back, block);
        });
        EXPECT_TRUE(link.client.write(block.data(), static_cast<int>(block.size())));
        reader.join();
    };
    transfer(SocketLink());
    transfer(PipeLink());
    const itimerval quiet{};
    ::setitimer(ITIMER_REAL, &quiet, nullptr);
    ::sigaction(SIGALRM, &former, nullptr);
}

TEST(TransportFaults, NoDescriptorLeaksAndNoneIsInherited) {
    ASSERT_TRUE(PipeLink().connect()) << "what stays open once is open now";
    const MessageRecorder messages;
    const auto before = openDescriptors();
    for (int i = 0; i < 20; ++i) {
        SocketLink socket;
        PipeLink pipe;
        ASSERT_TRUE(socket.connect() && pipe.connect());
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
#if defined(__has_feature)
#if __has_feature(address_sanitizer)
    GTEST_SKIP() << "the sanitizer needs descriptors of its own";
#endif
#endif
    rlimit former{};
    ::getrlimit(RLIMIT_NOFILE, &former);
    const int used = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
    rlimit tight = former;
    tight.rlim_cur = static_cast<rlim_t>(used) + 1;
    ::setrlimit(RLIMIT_NOFILE, &tight);
    {
        const MessageRecorder messages;
        TessalSocket server(0, "", freshPort());
        EXPECT_FALSE(server.initialize());
        EXPECT_THAT(messages.status(), ElementsAre(" socket() failed: 24\n"));
        EXPECT_FALSE(TessalPipe(0, freshPipeName().c_str()).initialize());
    }
    ::setrlimit(RLIMIT_NOFILE, &former);
    ::close(used);
}

}  // namespace

#endif
