// SPDX-License-Identifier: Apache-2.0
// The sending end of a message port.
#include <csignal>
#include <thread>

#include "Platform/Qt/FrameChannel.h"
#include "Tests/Platform/Qt/PortTest.h"
#include "Tests/Platform/Qt/RawSocket.h"
#include "Tests/Platform/Qt/Spawned.h"

namespace kelvasi::test {
namespace {

using namespace std::chrono_literals;
using Reply = RemotePort::Reply;
using testing::ElementsAre;

constexpr auto patience = 60000ms;  // where an answer is sure to come, on a busy machine too
constexpr auto brief = 20ms;        // where none is

std::optional<std::string> replyOf(const SendResult& result) {
  return result.reply ? std::optional(textOf(*result.reply)) : std::nullopt;
}

// To another process that replies with what it is sent.
class RemotePortTest : public PortTest {
 protected:
  RemotePortTest() {
    EXPECT_EQ(peer.line(), "ready");
    port = ports.createRemotePort("peer");
    EXPECT_NE(port, nullptr);
  }
  SendResult ask(std::string_view text, std::chrono::milliseconds receiveTimeout = patience) {
    return port->sendRequest(0, bytesOf(text), patience, receiveTimeout, Reply::awaited);
  }

  Spawned peer{{"receive", "peer"}};
  std::unique_ptr<RemotePort> port;
};

TEST_F(RemotePortTest, BringsTheReply) {
  const SendResult result = ask("question");
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_EQ(replyOf(result), "question");
  EXPECT_EQ(peer.line(), "message 0 8 [question]");
}

TEST_F(RemotePortTest, SucceedsWithoutAReplyWhenThePeerHasNone) {
  const SendResult result = ask("nothing");
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_FALSE(result.reply);
}

TEST_F(RemotePortTest, TellsAnEmptyReplyFromNone) {
  const SendResult result = ask("");
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_EQ(replyOf(result), "");
}

TEST_F(RemotePortTest, WaitsForNoReplyWhenNoneIsAwaited) {
  const SendResult result = port->sendRequest(3, bytesOf("start"), patience, 0ms, Reply::none);
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_FALSE(result.reply);
  EXPECT_EQ(peer.line(), "message 3 5 [start]");
}

TEST_F(RemotePortTest, KeepsTheOrderOfMessagesAndRequests) {
  EXPECT_TRUE(port->sendNow(1, bytesOf("a")));
  EXPECT_TRUE(port->sendNow(2, bytesOf("b")));
  EXPECT_EQ(ask("c").status, SendStatus::success);
  EXPECT_EQ(peer.line(), "message 1 1 [a]");
  EXPECT_EQ(peer.line(), "message 2 1 [b]");
  EXPECT_EQ(peer.line(), "message 0 1 [c]");
}

TEST_F(RemotePortTest, SendsWhatIsLeftWhenItIsDestroyed) {
  port->sendNow(0, bytesOf("farewell"));
  port.reset();
  EXPECT_EQ(peer.line(), "message 0 8 [farewell]");
}

TEST_F(RemotePortTest, GivesUpTheReplyOfAStoppedPeer) {
  peer.stop();
  EXPECT_EQ(ask("sleep well", brief).status, SendStatus::receiveTimeout);
  EXPECT_TRUE(port->isValid());
  peer.resume();
  EXPECT_EQ(replyOf(ask("awake")), "awake");
}

TEST_F(RemotePortTest, GivesUpSendingWhenAStoppedPeersBufferIsFull) {
  peer.stop();
  const Bytes large(std::size_t{4} << 20, 'l');
  EXPECT_EQ(port->sendRequest(0, large, brief, patience, Reply::awaited).status, SendStatus::sendTimeout);
  EXPECT_EQ(port->sendRequest(0, large, brief, patience, Reply::none).status, SendStatus::sendTimeout);
  EXPECT_EQ(port->sendRequest(0, {}, 0ms, patience, Reply::none).status, SendStatus::sendTimeout);
  peer.resume();
  EXPECT_EQ(replyOf(ask("awake")), "awake");
  EXPECT_EQ(peer.line(), "message 0 4194304 [" + std::string(64, 'l') + "]");
}

TEST_F(RemotePortTest, SendsTheLargestMessageAndNothingLarger) {
  Bytes data(maximumFrameData, 'x');
  const SendResult result = port->sendRequest(0, data, patience, patience, Reply::awaited);
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_TRUE(result.reply == data);
  data.push_back('x');
  EXPECT_EQ(port->sendRequest(0, data, patience, patience, Reply::awaited).status, SendStatus::invalid);
  EXPECT_FALSE(port->sendNow(0, data));
  EXPECT_TRUE(port->isValid());
}

TEST_F(RemotePortTest, BoundsTheBacklogOfAStoppedPeer) {
  peer.stop();
  const Bytes data(std::size_t{64} << 10);
  std::size_t taken = 0;
  while (taken < 4 * FrameChannel::backlogLimit && port->sendNow(0, data)) taken += data.size();
  EXPECT_GE(taken, FrameChannel::backlogLimit);
  EXPECT_LT(taken, FrameChannel::backlogLimit + (std::size_t{1} << 20));
  peer.resume();
  EXPECT_TRUE(runUntil([&] { return port->sendNow(0, {}); }));
}

TEST_F(RemotePortTest, NoticesThePeersDeathWithoutTheEventLoop) {
  peer.kill();
  EXPECT_FALSE(port->isValid());
  EXPECT_EQ(ask("anybody?").status, SendStatus::invalid);
  EXPECT_TRUE(runUntil([this] { return !port->sendNow(0, {}); }));
}

TEST_F(RemotePortTest, TellsOfThePeersDeathOnce) {
  int calls = 0;
  port->setInvalidationHandler([&] { ++calls; });
  peer.kill();
  EXPECT_TRUE(runUntil([&] { return calls > 0; }));
  port->invalidate();
  runWhatIsDue();
  EXPECT_EQ(calls, 1);
}

TEST_F(RemotePortTest, TellsOfADeathThatARequestMet) {
  RawListener listener(directory + "/raw");
  port = ports.createRemotePort("raw");
  std::jthread dying([&] { listener.accept().read(16 + 3); });
  int calls = 0;
  port->setInvalidationHandler([&] { ++calls; });
  EXPECT_EQ(ask("die").status, SendStatus::becameInvalid);
  EXPECT_EQ(calls, 0) << "no handler runs inside the request";
  EXPECT_TRUE(runUntil([&] { return calls == 1; }));
}

TEST_F(RemotePortTest, MayBeDestroyedByItsInvalidationHandler) {
  port->setInvalidationHandler([this] { port.reset(); });
  peer.kill();
  EXPECT_TRUE(runUntil([this] { return port == nullptr; }));
  runWhatIsDue();
}

TEST_F(RemotePortTest, MayBeDestroyedFromWithinInvalidate) {
  port->setInvalidationHandler([this] { port.reset(); });
  port->invalidate();
  EXPECT_EQ(port, nullptr);
}

TEST_F(RemotePortTest, IsSilentWithoutAHandlerOrWhenDestroyed) {
  int calls = 0;
  port->setInvalidationHandler([&] { ++calls; });
  port->setInvalidationHandler({});
  port->invalidate();
  EXPECT_FALSE(port->isValid());
  port = ports.createRemotePort("peer");
  port->setInvalidationHandler([&] { ++calls; });
  port.reset();
  runWhatIsDue();
  EXPECT_EQ(calls, 0);
}

TEST_F(RemotePortTest, IsRefusedWhenNobodyListens) {
  EXPECT_EQ(ports.createRemotePort("nobody"), nullptr);
  peer.kill();
  EXPECT_EQ(ports.createRemotePort("peer"), nullptr);
  EXPECT_THAT(log.errors(), testing::IsEmpty());
}

TEST_F(RemotePortTest, IsRefusedWhenTheListenersQueueStaysFull) {
  const RawListener listener(directory + "/raw", 0);
  std::vector<std::unique_ptr<RemotePort>> connected;
  for (int i = 0; i < 3; ++i) connected.push_back(ports.createRemotePort("raw"));
  EXPECT_EQ(connected.back(), nullptr);
  EXPECT_FALSE(log.errors().empty());
}

TEST_F(RemotePortTest, MakesIdentifiersThatDiffer) {
  const auto one = ports.makeUniqueIdentifier();
  EXPECT_EQ(one.value().size(), 36u);
  EXPECT_NE(one, ports.makeUniqueIdentifier());
}

// To a peer whose bytes are typed.
class RawPeerTest : public PortTest {
 protected:
  SendResult ask(std::chrono::milliseconds receiveTimeout) {
    return port->sendRequest(0, bytesOf("ask"), patience, receiveTimeout, Reply::awaited);
  }
  // The token of the next request of three bytes.
  std::uint32_t tokenOfNext() {
    const Bytes request = peer.read(16 + 3);
    std::uint32_t token = 0;
    for (std::size_t i = 0; i < 4; ++i) token |= std::uint32_t{request.at(12 + i)} << (8 * i);
    return token;
  }

  RawListener listener{directory + "/raw"};
  std::unique_ptr<RemotePort> port = ports.createRemotePort("raw");
  RawSocket peer = listener.accept();
};

TEST_F(RawPeerTest, DiscardsAReplyThatComesAfterItsTimeOut) {
  EXPECT_EQ(ask(0ms).status, SendStatus::receiveTimeout);
  std::jthread late([this] {
    const std::uint32_t first = tokenOfNext();
    const std::uint32_t second = tokenOfNext();
    peer.write(frame(3, 0, first, bytesOf("too late")));
    peer.write(frame(3, 0, second, bytesOf("in time")));
  });
  EXPECT_EQ(replyOf(ask(patience)), "in time");
}

TEST_F(RawPeerTest, DiscardsALateReplyInTheEventLoop) {
  EXPECT_EQ(ask(0ms).status, SendStatus::receiveTimeout);
  peer.write(frame(3, 0, tokenOfNext(), bytesOf("too late")));
  runWhatIsDue();
  EXPECT_TRUE(port->isValid());
  EXPECT_THAT(log.errors(), testing::IsEmpty());
}

TEST_F(RawPeerTest, GivesUpAReplyThatDribblesWithoutEnd) {
  std::jthread dribbling([this] {
    peer.write(header(16777216, 3, 0, tokenOfNext()));
    while (peer.write({'.'})) continue;
  });
  EXPECT_EQ(ask(brief).status, SendStatus::receiveTimeout);
  port.reset();
}

TEST_F(RawPeerTest, GivesUpAPeerThatSendsOnlyForeignReplies) {
  std::jthread chattering([this] {
    const Bytes foreign = frame(3, 0, tokenOfNext() + 1, bytesOf("foreign"));
    while (peer.write(foreign)) continue;
  });
  EXPECT_EQ(ask(brief).status, SendStatus::receiveTimeout);
  port.reset();
}

TEST_F(RawPeerTest, CompletesAMessageThatTimedOutHalfway) {
  const Bytes large(std::size_t{4} << 20, 'l');
  EXPECT_EQ(port->sendRequest(5, large, brief, 0ms, Reply::none).status, SendStatus::sendTimeout);
  EXPECT_EQ(port->sendRequest(6, bytesOf("withdrawn"), 0ms, 0ms, Reply::none).status,
            SendStatus::sendTimeout);
  Bytes received;
  std::jthread reading([&] { received = peer.readToEnd(); });
  EXPECT_EQ(port->sendRequest(7, bytesOf("next"), patience, 0ms, Reply::none).status, SendStatus::success);
  port.reset();
  reading.join();
  Bytes expected = frame(1, 5, 0, large);
  const Bytes next = frame(1, 7, 0, bytesOf("next"));
  expected.insert(expected.end(), next.begin(), next.end());
  EXPECT_TRUE(received == expected) << received.size() << " bytes";
}

TEST_F(RawPeerTest, EndsARequestWhoseReplyIsMalformed) {
  peer.write(header(0xFFFFFFFF, 3, 0, 1));
  EXPECT_EQ(ask(patience).status, SendStatus::becameInvalid);
  EXPECT_FALSE(port->isValid());
  runWhatIsDue();
  EXPECT_THAT(log.errors(), ElementsAre("raw: frame of more than 16 MiB; connection closed"));
}

TEST_F(RawPeerTest, ClosesAPeerThatSendsMessagesTheWrongWay) {
  peer.write(frame(1, 0, 0, bytesOf("wrong way")));
  EXPECT_TRUE(runUntil([this] { return !port->isValid(); }));
  EXPECT_THAT(log.errors(),
              ElementsAre("raw: frame of a kind or size that has no place here; connection closed"));
}

}  // namespace
}  // namespace kelvasi::test
