// Setting up and failing to: ports, names, attempts, messages.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "MessageRecorder.h"
#include "tests/transport/Links.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

TEST(SocketSetup, APortInUseIsRefusedAndAServerThatIsNotUpIsToldOnce) {
    int port = 0;
    const std::unique_ptr<TessalSocket> server = listeningServer(port);
    const MessageRecorder messages;
    EXPECT_FALSE(TessalSocket(0, nullptr, port).initialize());
    TessalSocket client(1, "127.0.0.1", 1);
    EXPECT_FALSE(client.initialize()) << "without a message";
    EXPECT_FALSE(client.connectToServer());
    EXPECT_THAT(messages.status(), ElementsAre(StartsWith(" bind() failed: "), StartsWith(" connect() failed: ")));
    EXPECT_NE(client.getClientSocketFd(), TessalSocket::noSocket) << "the socket of the last attempt";
}

/// A host whose calls fail as told, and that connects at the attempt told.
class FailingHost : public ByteByByteHost {
public:
    bool startFails = false, openFails = false, resolveFails = false, closeFails = false;
    int connectsBeforeSuccess = 0, attempts = 0, pauses = 0, started = 0;

    bool start() override {
        started += startFails ? 0 : 1;
        return !startFails;
    }
    void stop() override { --started; }
    platform::Socket openClient() override { return openFails ? platform::noSocket : 7; }
    bool resolve(const char*, std::uint16_t, platform::SocketAddress&) override {
        ++attempts;
        return !resolveFails;
    }
    bool connect(platform::Socket, const platform::SocketAddress&) override { return attempts > connectsBeforeSuccess; }
    bool close(platform::Socket) override { return !closeFails; }
    int lastError() override { return 104; }
    void pause(int milliseconds) override { pauses += milliseconds; }
};

class ScriptedSocket : public testing::Test, HostInPlace<FailingHost> {
protected:
    FailingHost& failing = host;
    MessageRecorder messages;
    TessalSocket client{1, "server", 5};
};

TEST_F(ScriptedSocket, TenAttemptsAreMadeBehindOnePause) {
    failing.connectsBeforeSuccess = 9;
    EXPECT_TRUE(client.connectToServer());
    EXPECT_EQ(failing.attempts, 10);
    EXPECT_EQ(failing.pauses, 50);
    EXPECT_THAT(messages.all(), IsEmpty());
    failing.connectsBeforeSuccess = 100;
    failing.closeFails = true;
    EXPECT_FALSE(client.connectToServer());
    EXPECT_EQ(failing.attempts, 20);
    std::vector<std::string> expected(10, " closesocket() failed: 104\n");
    expected.emplace_back(" connect() failed: 104\n");
    EXPECT_EQ(messages.status(), expected);
}

TEST_F(ScriptedSocket, EachStepThatFailsIsTold) {
    for (bool* const fault : {&failing.startFails, &failing.openFails, &failing.resolveFails}) {
        *fault = true;
        EXPECT_FALSE(client.initialize());
        *fault = false;
    }
    EXPECT_THAT(messages.status(), ElementsAre("Failed to load Winsock!\n", " socket() failed: 104\n",
                                               "Unable to resolve server: server\n"));
    EXPECT_TRUE(client.deinitialize());
    EXPECT_TRUE(client.deinitialize());
    EXPECT_EQ(failing.started, 0) << "stopped as often as started";
    messages.clear();
    failing.resolveFails = true;
    EXPECT_FALSE(client.connectToServer());
    EXPECT_EQ(messages.status().size(), 11U) << "each of ten attempts, and the end";
}

TEST(SocketSetup, ANameThatIsTooLongIsNoName) {
    const MessageRecorder messages;
    TessalSocket client(1, std::string(128, 'x').c_str(), 1);
    EXPECT_FALSE(client.initialize());
    EXPECT_THAT(messages.status(), ElementsAre("Unable to resolve server: \n"));
    char count[] = "abx";
    client.setBufferCount(count, 0x12345);
    EXPECT_STREQ(count, "\x45\x23x");
}

TEST(PipeSetup, AClientWithoutServerFailsAtOnce) {
    MessageRecorder messages;
    TessalPipe client(1, freshPipeName().c_str());
    EXPECT_TRUE(client.connectToServer()) << "says nothing about a connection";
    EXPECT_FALSE(client.initialize());
    EXPECT_THAT(messages.debug(), ElementsAre(StartsWith(" Create pipe failed, status = ")));
    EXPECT_FALSE(client.waitForClient());
    messages.clear();
    char byte = 0;
    EXPECT_FALSE(client.readSocket(nullptr, 1) || client.readSocket(&byte, 1) || client.writeSocket(&byte, 1));
    EXPECT_EQ(client.writeString(client.getClientSocketFd(), "abc"), 3);
    const auto notRead = StartsWith("ReadFile failed: "), read = StartsWith(" read : ");
    const auto notWritten = StartsWith("WriteFile failed: "), write = StartsWith(" write : ");
    EXPECT_THAT(messages.status(), ElementsAre(notRead, read, notRead, read, notWritten, write, notWritten, notWritten,
                                               "TessalSocket::writeString error.\n"));
}

TEST(PipeSetup, ASecondServerLeavesTheFirstAlone) {
    const std::string name = freshPipeName();
    TessalPipe first(0, name.c_str());
    ASSERT_TRUE(first.initialize());
    TessalPipe second(0, name.c_str());
    EXPECT_TRUE(second.initialize()) << "the pipe is there";
    EXPECT_NE(first.getClientSocketFd(), second.getClientSocketFd());
    EXPECT_FALSE(second.waitForClient());

    TessalPipe client(1, name.c_str());
    ASSERT_TRUE(client.initialize());
    EXPECT_TRUE(first.waitForClient()) << "a client that was quicker";
    EXPECT_TRUE(first.waitForClient());
    TessalPipe late(1, name.c_str());
    EXPECT_FALSE(late.initialize()) << "one client for a server end";
    EXPECT_EQ(client.writeInt(client.getClientSocketFd(), 5), 4);
    int value = 0;
    first.readInt(first.getClientSocketFd(), &value);
    EXPECT_EQ(value, 5) << "looking for the pipe was no client";
    EXPECT_TRUE(first.close(nullptr) && first.close(nullptr));
    TessalPipe third(0, name.c_str());
    EXPECT_TRUE(third.initialize());
    EXPECT_NE(third.getClientSocketFd(), second.getClientSocketFd()) << "the name is free again";
}

TEST(PipeSetup, NamesThatAreNoneAreRefused) {
    const std::string prefix = "\\\\.\\pipe\\";
    for (const std::string& name : {std::string(), prefix, std::string(128, 'x'), prefix + std::string(120, 'y')}) {
        EXPECT_FALSE(TessalPipe(0, name.c_str()).initialize() || TessalPipe(1, name.c_str()).initialize()) << name;
    }
    EXPECT_FALSE(TessalPipe(1, nullptr).initialize());
}

}  // namespace
