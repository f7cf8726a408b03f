// Setting up and failing to: ports, names, attempts, messages.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "MessageRecorder.h"
#include "platform/StreamSocket.h"
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

/// A host whose calls fail as told, that connects at the attempt told, and that moves one byte a call.
class ScriptedHost : public platform::SocketHost {
public:
    using Socket = platform::Socket;

    bool startFails = false, openFails = false, resolveFails = false, closeFails = false;
    int connectsBeforeSuccess = 0, attempts = 0, pauses = 0, started = 0;
    std::string wire;  ///< sent, and not yet received

    bool start() override {
        started += startFails ? 0 : 1;
        return !startFails;
    }
    void stop() override { --started; }
    Socket openServer() override { return platform::noSocket; }
    Socket openClient() override { return openFails ? platform::noSocket : 7; }
    bool bindAny(Socket, std::uint16_t) override { return false; }
    void listen(Socket, int) override {}
    Socket accept(Socket, sockaddr*, int*) override { return platform::noSocket; }
    bool resolve(const char*, std::uint16_t, platform::SocketAddress&) override {
        ++attempts;
        return !resolveFails;
    }
    bool connect(Socket, const platform::SocketAddress&) override { return attempts > connectsBeforeSuccess; }
    std::int64_t receive(Socket, char* data, int) override {
        const std::size_t moved = wire.copy(data, 1);
        wire.erase(0, moved);
        return static_cast<std::int64_t>(moved);
    }
    std::int64_t send(Socket, const char* data, int) override {
        wire += *data;
        return 1;
    }
    bool close(Socket) override { return !closeFails; }
    int lastError() override { return 104; }
    void pause(int milliseconds) override { pauses += milliseconds; }
};

class ScriptedSocket : public testing::Test {
protected:
    ScriptedSocket() { platform::replaceSocketHost(&host); }
    ~ScriptedSocket() override { platform::replaceSocketHost(nullptr); }

    ScriptedHost host;
    MessageRecorder messages;
    TessalSocket client{1, "server", 5};
};

TEST_F(ScriptedSocket, TenAttemptsAreMadeBehindOnePause) {
    host.connectsBeforeSuccess = 9;
    EXPECT_TRUE(client.connectToServer());
    EXPECT_EQ(host.attempts, 10);
    EXPECT_EQ(host.pauses, 50);
    EXPECT_THAT(messages.all(), IsEmpty());
    host.connectsBeforeSuccess = 100;
    host.closeFails = true;
    EXPECT_FALSE(client.connectToServer());
    EXPECT_EQ(host.attempts, 20);
    std::vector<std::string> expected(10, " closesocket() failed: 104\n");
    expected.emplace_back(" connect() failed: 104\n");
    EXPECT_EQ(messages.status(), expected);
}

TEST_F(ScriptedSocket, EachStepThatFailsIsTold) {
    for (bool* const fault : {&host.startFails, &host.openFails, &host.resolveFails}) {
        *fault = true;
        EXPECT_FALSE(client.initialize());
        *fault = false;
    }
    EXPECT_THAT(messages.status(), ElementsAre("Failed to load Winsock!\n", " socket() failed: 104\n",
                                               "Unable to resolve server: server\n"));
    EXPECT_TRUE(client.deinitialize());
    EXPECT_TRUE(client.deinitialize());
    EXPECT_EQ(host.started, 0) << "stopped as often as started";
    messages.clear();
    host.resolveFails = true;
    EXPECT_FALSE(client.connectToServer());
    EXPECT_EQ(messages.status().size(), 11U) << "each of ten attempts, and the end";
}

TEST_F(ScriptedSocket, FieldsPassWholeThoughTheHostMovesOneByteACall) {
    using namespace std::string_literals;
    EXPECT_EQ(client.writeInt(7, 0x01020304), 4);
    EXPECT_TRUE(client.writeBool(7, true));
    EXPECT_EQ(client.writeString(7, nullptr), 0);
    EXPECT_EQ(host.wire, "\4\3\2\1\1\0\0\0\0"s);
    host.wire = "\3\2";  // of a truth value the lowest bit counts
    for (const bool expected : {true, false}) {
        bool value = !expected;
        EXPECT_TRUE(client.readBool(7, &value));
        EXPECT_EQ(value, expected);
    }
    for (const int length : {2, 8192, 8193}) {  // short texts go out together with their length
        const std::string text(static_cast<std::size_t>(length), 'x');
        EXPECT_EQ(client.writeString(7, text.c_str()), length);
        int announced = 0;
        EXPECT_EQ(client.readInt(7, &announced), 4);
        EXPECT_EQ(announced, length);
        std::string back(text.size(), '?');
        EXPECT_TRUE(client.read(7, back.data(), length));
        EXPECT_EQ(back, text);
    }
    EXPECT_EQ(host.wire, "");
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
    TessalPipe client(1, freshPipeName().c_str());
    EXPECT_FALSE(client.initialize() || client.waitForClient());
    const MessageRecorder messages;
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
