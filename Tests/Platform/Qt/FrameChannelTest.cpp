// SPDX-License-Identifier: Apache-2.0
// How much a channel keeps for a peer that takes nothing.
#include "Platform/Qt/FrameChannel.h"

#include <fcntl.h>
#include <sys/socket.h>

#include <array>
#include <optional>
#include <thread>

#include "Tests/Platform/Qt/PortTest.h"
#include "Tests/Platform/Qt/RawSocket.h"

namespace kelvasi::test {
namespace {

class FrameChannelTest : public PortTest {
 protected:
  FrameChannelTest() {
    std::array<int, 2> ends{};
    EXPECT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    peer.emplace(FileDescriptor(ends[0]));
    EXPECT_EQ(::fcntl(ends[1], F_SETFL, O_NONBLOCK), 0);
    channel = std::make_shared<FrameChannel>(FileDescriptor(ends[1]), "channel", log);
    channel->start([](const Frame&) { return true; }, [] {});
  }
  // A frame of so many bytes, its header included.
  bool post(std::size_t size) {
    return channel->post({.kind = FrameKind::message}, Bytes(size - frameHeaderSize));
  }
  // Until the socket takes no more, then until so much waits.
  void holdBack(std::size_t size) {
    while (channel->held() < (std::size_t{1} << 20)) ASSERT_TRUE(post(std::size_t{64} << 10));
    while (channel->held() < size) {
      const std::size_t left = size - channel->held();
      ASSERT_TRUE(post(left < (std::size_t{128} << 10) ? left : std::size_t{64} << 10));
    }
    ASSERT_EQ(channel->held(), size);
  }

  std::optional<RawSocket> peer;
  std::shared_ptr<FrameChannel> channel;
};

TEST_F(FrameChannelTest, TakesAFrameWhileNoMoreThan8MiBWait) {
  holdBack(FrameChannel::backlogLimit);
  EXPECT_TRUE(post(frameHeaderSize));
  EXPECT_FALSE(post(frameHeaderSize));
  EXPECT_TRUE(channel->isOpen());
}

TEST_F(FrameChannelTest, TakesNoFrameWhenAByteMoreWaits) {
  holdBack(FrameChannel::backlogLimit + 1);
  EXPECT_FALSE(post(frameHeaderSize));
}

TEST_F(FrameChannelTest, HoldsNothingWhenThePeerHasTakenAll) {
  holdBack(std::size_t{2} << 20);
  std::thread reader([this] { peer->readToEnd(); });
  EXPECT_TRUE(runUntil([this] { return channel->held() == 0; }));
  EXPECT_TRUE(post(frameHeaderSize));
  channel->close();
  reader.join();
}

}  // namespace
}  // namespace kelvasi::test
