// One suite over every transport: the same fields, the same bytes, the same results.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "DataBuffer.h"
#include "MessageRecorder.h"
#include "tests/transport/Links.h"

namespace {

using namespace std::string_literals;

template <class LinkType>
class Transport : public testing::Test {
protected:
    /// The next bytes at the server's end.
    std::string arrived(std::size_t count) {
        std::string bytes(count, '?');
        EXPECT_TRUE(link.server.read(bytes.data(), static_cast<int>(count)));
        return bytes;
    }

    LinkType link;
};

using Links = testing::Types<SocketLink, PipeLink, ByteByByteLink>;
TYPED_TEST_SUITE(Transport, Links, );

TYPED_TEST(Transport, FieldsAreTheSameBytesEverywhere) {
    TessalPortMux& client = this->link.client;
    EXPECT_EQ(client.writeInt(0x01020304), 4);
    EXPECT_TRUE(client.writeBool(true));
    EXPECT_TRUE(client.writeBool(false));
    EXPECT_EQ(client.writeString("ab"), 2);
    EXPECT_EQ(client.writeString(nullptr), 0);
    EXPECT_TRUE(client.writeSocket("raw", 3));
    DataBuffer inMemory(4);
    inMemory.writeInt(-2);
    inMemory.writeString("text");
    EXPECT_TRUE(client.writeSocket(inMemory.getBuffer(), inMemory.getLength()));
    EXPECT_EQ(this->arrived(31), "\4\3\2\1\1\0\2\0\0\0ab\0\0\0\0raw\xFE\xFF\xFF\xFF\4\0\0\0text"s);
}

TYPED_TEST(Transport, FieldsComeBackAsTheyWent) {
    for (const int number : {0, -1, 255, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
        this->link.server.writeInt(number);
        int back = 7;
        EXPECT_EQ(this->link.client.readInt(&back), 4);
        EXPECT_EQ(back, number);
    }
    this->link.server.write("\x03\x02", 2);
    for (const bool expected : {true, false}) {
        bool value = !expected;
        EXPECT_TRUE(this->link.client.readBool(&value));
        EXPECT_EQ(value, expected);
    }
}

TYPED_TEST(Transport, BlocksOfAnySizePassWhole) {
    expectEcho(this->link);
}

TYPED_TEST(Transport, APeerThatHasClosedIsAFailureAtOnce) {
    this->link.server.write("\1\2", 2);
    this->link.closeServerEnd();
    EXPECT_TRUE(this->link.client.read(nullptr, 0) && this->link.client.write(nullptr, -1)) << "nothing to move";
    const MessageRecorder messages;
    int value = 99;
    EXPECT_EQ(this->link.client.readInt(&value), 4);
    EXPECT_EQ(value, 0) << "not half a number";
    bool flag = true;
    EXPECT_FALSE(this->link.client.readBool(&flag));
    EXPECT_TRUE(flag) << "left alone";
    const auto failure = testing::StartsWith(TypeParam::receiveFailure);
    EXPECT_THAT(messages.status(), testing::ElementsAre(failure, failure));
    char block[1024] = {};
    bool sent = true;
    for (int attempt = 0; sent && attempt < 100; ++attempt) {
        sent = this->link.client.write(block, sizeof block);
    }
    EXPECT_FALSE(sent) << "the process lives, and the host has noticed";
    EXPECT_EQ(this->link.client.writeInt(1), 0);
    EXPECT_EQ(this->link.client.writeString("abc"), 3);
}

TEST(PortMux, TheSelectionDecidesAndAMissingTransportFails) {
    TessalPortMux mux(true);
    char byte = 0;
    EXPECT_FALSE(mux.read(&byte, 1) || mux.writeBool(true) || mux.writeInt(1) != 0);
    mux.setClientSocketFd(5);
    TessalSocket stored(0, "", 1);
    mux.setSocketHandle(&stored);
    mux.setClientSocketFd(77);
    EXPECT_EQ(stored.getClientSocketFd(), 77U);
    stored.setClientSocketFd(TessalSocket::noSocket);
}

}  // namespace
