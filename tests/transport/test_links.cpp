// One suite over every transport: the same bytes, the same results.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <future>

#include "MessageRecorder.h"
#include "tests/transport/Links.h"

namespace {

template <class LinkType>
struct Transport : testing::Test {
    LinkType link;
};

using Links = testing::Types<SocketLink, PipeLink>;
TYPED_TEST_SUITE(Transport, Links, );

TYPED_TEST(Transport, BlocksOfAnySizePassWhole) {
    expectEcho(this->link);
}

TYPED_TEST(Transport, TheRestOfAFieldIsWaitedFor) {
    this->link.client.write("\4\3", 2);
    int value = 0;
    const std::future<int> reading = std::async(std::launch::async, [&] { return this->link.server.readInt(&value); });
    EXPECT_EQ(reading.wait_for(std::chrono::milliseconds(100)), std::future_status::timeout);
    this->link.client.write("\2\1", 2);
    reading.wait();
    EXPECT_EQ(value, 0x01020304);
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

TEST(PortMux, FailsWithoutATransport) {
    TessalPortMux mux(true);
    char byte = 0;
    EXPECT_FALSE(mux.read(&byte, 1) || mux.writeBool(true) || mux.writeInt(1) != 0);
    mux.setClientSocketFd(5);
}

}  // namespace
