// SPDX-License-Identifier: Apache-2.0
// The receiving end of a message port.
#include <array>
#include <atomic>
#include <csignal>
#include <thread>

#include "Platform/Qt/Frame.h"
#include "Tests/Platform/Qt/PortTest.h"
#include "Tests/Platform/Qt/RawSocket.h"
#include "Tests/Platform/Qt/Spawned.h"

namespace kelvasi::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class LocalPortTest : public PortTest {
 protected:
  // Notes what it is sent; replies with the same, but not to "nothing".
  LocalPort::ReceiveHandler echo() {
    return [this](MessageId id, std::span<const std::uint8_t> data) -> std::optional<Bytes> {
      received.push_back(std::to_string(id) + ":" + textOf(data));
      if (textOf(data) == "nothing") return std::nullopt;
      return Bytes(data.begin(), data.end());
    };
  }
  RawSocket connect() const { return RawSocket::connectTo(directory + "/port"); }
  bool runUntilReceived(std::size_t count) {
    return runUntil([this, count] { return received.size() >= count; });
  }

  std::vector<std::string> received;
  std::unique_ptr<LocalPort> port = ports.createLocalPort("port", echo());
};

TEST_F(LocalPortTest, ReceivesMessagesWithTheirIds) {
  RawSocket peer = connect();
  peer.write(frame(1, 0, 0, bytesOf("one")));
  peer.write(frame(1, 4000000000u, 0, {}));
  EXPECT_TRUE(runUntilReceived(2));
  EXPECT_THAT(received, ElementsAre("0:one", "4000000000:"));
}

TEST_F(LocalPortTest, SendsRepliesUnderTheRequestsToken) {
  RawSocket peer = connect();
  peer.write(frame(2, 7, 0x12345678, bytesOf("what")));
  peer.write(frame(2, 7, 9, bytesOf("nothing")));
  peer.write(frame(1, 7, 0, bytesOf("unanswered")));
  peer.write(frame(2, 7, 10, {}));
  EXPECT_TRUE(runUntilReceived(4));
  runWhatIsDue();
  port.reset();
  const Bytes bytes = peer.readToEnd();
  const Bytes expected{4, 0, 0, 0, 1, 3, 0, 0, 0, 0, 0, 0, 0x78, 0x56, 0x34, 0x12, 'w', 'h', 'a', 't',  //
                       0, 0, 0, 0, 1, 4, 0, 0, 0, 0, 0, 0, 9,    0,    0,    0,                         //
                       0, 0, 0, 0, 1, 3, 0, 0, 0, 0, 0, 0, 10,   0,    0,    0};
  EXPECT_EQ(bytes, expected);
}

TEST_F(LocalPortTest, RepliesUnderToken0Too) {
  RawSocket peer = connect();
  peer.write(frame(2, 7, 0, bytesOf("what")));
  EXPECT_TRUE(runUntilReceived(1));
  runWhatIsDue();
  EXPECT_EQ(peer.read(20), frame(3, 0, 0, bytesOf("what")));
}

TEST_F(LocalPortTest, TakesFramesThatComeByteByByte) {
  RawSocket peer = connect();
  for (const std::uint8_t byte : frame(1, 5, 0, bytesOf("dribble"))) {
    peer.write({byte});
    runWhatIsDue();
  }
  EXPECT_TRUE(runUntilReceived(1));
  EXPECT_THAT(received, ElementsAre("5:dribble"));
}

TEST_F(LocalPortTest, ServesOtherConnectionsWhileOneDribbles) {
  RawSocket slow = connect();
  slow.write({1, 0, 0});
  RawSocket quick = connect();
  quick.write(frame(1, 0, 0, bytesOf("quick")));
  EXPECT_TRUE(runUntilReceived(1));
  EXPECT_THAT(received, ElementsAre("0:quick"));
}

struct Malformed {
  std::string name;
  Bytes bytes;
  std::string reason;
};

void PrintTo(const Malformed& malformed, std::ostream* out) {
  *out << malformed.reason;
}

class MalformedFrames : public LocalPortTest, public testing::WithParamInterface<Malformed> {};

TEST_P(MalformedFrames, CloseTheConnectionWithOneLine) {
  RawSocket bystander = connect();
  RawSocket peer = connect();
  Bytes sent = frame(1, 0, 0, bytesOf("before"));
  const Bytes tail = frame(1, 0, 0, bytesOf("after"));
  sent.insert(sent.end(), GetParam().bytes.begin(), GetParam().bytes.end());
  sent.insert(sent.end(), tail.begin(), tail.end());
  peer.write(sent);
  EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
  runWhatIsDue();
  EXPECT_THAT(log.errors(), ElementsAre("port: " + GetParam().reason + "; connection closed"));
  EXPECT_EQ(peer.read(1).size(), 0u);
  bystander.write(frame(1, 0, 0, bytesOf("bystander")));
  EXPECT_TRUE(runUntilReceived(2));
  EXPECT_THAT(received, ElementsAre("0:before", "0:bystander"));
  EXPECT_TRUE(port->isValid());
}

INSTANTIATE_TEST_SUITE_P(
    Of, MalformedFrames,
    testing::Values(Malformed{"TooManyData", header(16777217, 1, 0, 0), "frame of more than 16 MiB"},
                    Malformed{"AllOnesLength", header(0xFFFFFFFF, 1, 0, 0), "frame of more than 16 MiB"},
                    Malformed{"KindZero", header(0, 0, 0, 0), "frame of an unknown kind"},
                    Malformed{"KindEight", header(0, 8, 0, 0), "frame of an unknown kind"},
                    Malformed{"OnlyZeros", Bytes(16), "frame of an unknown version"},
                    Malformed{"ReservedByte", Bytes{0, 0, 0, 0, 1, 1, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0},
                              "frame with reserved bytes in use"},
                    Malformed{"Reply", header(0, 3, 0, 1), "frame of a kind or size that has no place here"},
                    Malformed{"ServersRequest", header(0, 5, 0, 1),
                              "frame of a kind or size that has no place here"}),
    [](const auto& malformed) { return malformed.param.name; });

TEST_F(LocalPortTest, LogsAConnectionThatEndsInsideAFrame) {
  RawSocket peer = connect();
  peer.write(Bytes{3, 0, 0, 0, 1, 1, 0});
  peer.close();
  EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
  runWhatIsDue();
  EXPECT_THAT(log.errors(), ElementsAre("port: ended inside a frame; connection closed"));
}

TEST_F(LocalPortTest, SaysNothingOfAConnectionThatEndsBetweenFrames) {
  RawSocket peer = connect();
  peer.write(frame(1, 0, 0, bytesOf("last")));
  peer.close();
  RawSocket::connectTo(directory + "/port").close();
  EXPECT_TRUE(runUntilReceived(1));
  runWhatIsDue();
  EXPECT_THAT(log.errors(), testing::IsEmpty());
}

TEST_F(LocalPortTest, ReceivesOneHundredThousandMessagesInOrder) {
  std::uint32_t next = 0;
  bool isInOrder = true;
  const auto counting = ports.createLocalPort("counting", [&](MessageId, std::span<const std::uint8_t> data) {
    isInOrder = isInOrder && data.size() == 100 && littleEndian32(data.first<4>()) == next;
    ++next;
    return std::optional<Bytes>();
  });
  const Spawned sender({"send", "counting", "100000", "100"});
  EXPECT_TRUE(runUntil([&] { return next >= 100000; }));
  EXPECT_EQ(next, 100000u);
  EXPECT_TRUE(isInOrder);
}

TEST_F(LocalPortTest, TakesTheLargestFrame) {
  std::size_t size = 0;
  const auto large = ports.createLocalPort("large", [&](MessageId, std::span<const std::uint8_t> data) {
    size = data.size();
    return std::optional<Bytes>();
  });
  const Spawned sender({"send", "large", "1", "16777216"});
  EXPECT_TRUE(runUntil([&] { return size > 0; }));
  EXPECT_EQ(size, maximumFrameData);
  EXPECT_THAT(log.errors(), testing::IsEmpty());
}

TEST_F(LocalPortTest, ClosesAPeerThatLeavesItsRepliesUnread) {
  std::size_t requests = 0;
  const auto generous = ports.createLocalPort("generous", [&](MessageId, std::span<const std::uint8_t>) {
    ++requests;
    return std::optional<Bytes>(Bytes(std::size_t{1} << 20));
  });
  RawSocket peer = RawSocket::connectTo(directory + "/generous");
  for (std::uint32_t token = 1; token <= 20; ++token) peer.write(frame(2, 0, token, {}));
  EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
  EXPECT_THAT(log.errors(), ElementsAre("generous: peer leaves its replies unread; connection closed"));
  EXPECT_LT(requests, 12u);
}

TEST_F(LocalPortTest, ClosesConnectionsAboveTheLimit) {
  std::vector<RawSocket> peers;
  for (int i = 0; i < 65; ++i) {
    peers.push_back(connect());
    runWhatIsDue();
  }
  EXPECT_THAT(log.errors(), ElementsAre("port: more than 64 connections; connection closed"));
  peers.front().write(frame(1, 0, 0, bytesOf("still served")));
  EXPECT_TRUE(runUntilReceived(1));
}

// Four connections that hold 16 MiB each of frames which want one byte more.
class UnfinishedFrames : public LocalPortTest {
 protected:
  UnfinishedFrames() {
    Bytes unfinished = header(maximumFrameData, 1, 0, 0);
    unfinished.resize(maximumFrameData);
    for (RawSocket& holder : holders) EXPECT_TRUE(sendWhileTheLoopRuns(holder, unfinished));
  }
  bool sendWhileTheLoopRuns(RawSocket& peer, const Bytes& bytes) {
    std::atomic<bool> isDone = false;
    std::thread sender([&] { isDone = peer.write(bytes) || true; });
    const bool isSent = runUntil([&] { return isDone && peer.isTaken(); });
    sender.join();
    return isSent;
  }

  std::array<RawSocket, 4> holders{connect(), connect(), connect(), connect()};
};

TEST_F(UnfinishedFrames, OfAllConnectionsMayHoldAsMuchAsTheLimit) {
  runWhatIsDue();
  EXPECT_THAT(log.errors(), testing::IsEmpty());
  const Bytes rest(frameHeaderSize, 'x');
  for (RawSocket& holder : holders) EXPECT_TRUE(sendWhileTheLoopRuns(holder, rest));
  EXPECT_TRUE(runUntilReceived(4));
}

TEST_F(UnfinishedFrames, CloseTheWorstConnectionWithTheFirstByteMore) {
  EXPECT_TRUE(holders[2].write({'x'}));
  EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
  runWhatIsDue();
  EXPECT_THAT(log.errors(),
              ElementsAre("port: all connections hold more than 64 MiB, this one most; connection closed"));
  EXPECT_EQ(holders[2].read(1).size(), 0u);
  RawSocket bystander = connect();
  EXPECT_TRUE(bystander.write(frame(1, 0, 0, bytesOf("quick"))));
  EXPECT_TRUE(runUntilReceived(1));
  EXPECT_THAT(received, ElementsAre("0:quick"));
}

class Desertion : public LocalPortTest {
 protected:
  Desertion() {
    port->setDesertionHandler([this] { ++desertions; });
  }
  int desertions = 0;
};

TEST_F(Desertion, IsToldWhenTheLastWhoHadSentSomethingCloses) {
  RawSocket first = connect();
  RawSocket second = connect();
  first.write(frame(1, 0, 0, bytesOf("one")));
  second.write(frame(2, 0, 9, bytesOf("two")));
  EXPECT_TRUE(runUntilReceived(2));
  first.close();
  runWhatIsDue();
  EXPECT_EQ(desertions, 0);
  second.close();
  EXPECT_TRUE(runUntil([this] { return desertions > 0; }));
  EXPECT_EQ(desertions, 1);
}

TEST_F(Desertion, IsNotToldOfThoseWhoSaidNothing) {
  RawSocket speaker = connect();
  speaker.write(frame(1, 0, 0, bytesOf("one")));
  EXPECT_TRUE(runUntilReceived(1));
  connect().close();
  runWhatIsDue();
  EXPECT_EQ(desertions, 0);
}

TEST_F(Desertion, IsToldAfterAFaultToo) {
  RawSocket peer = connect();
  peer.write(frame(1, 0, 0, bytesOf("one")));
  peer.write(header(0, 9, 0, 0));
  EXPECT_TRUE(runUntil([this] { return desertions > 0; }));
}

TEST_F(Desertion, MayDestroyThePort) {
  port->setDesertionHandler([this] { port.reset(); });
  RawSocket silent = connect();
  RawSocket peer = connect();
  peer.write(frame(1, 0, 0, bytesOf("one")));
  EXPECT_TRUE(runUntilReceived(1));
  peer.close();
  EXPECT_TRUE(runUntil([this] { return !port; }));
  EXPECT_EQ(silent.read(1).size(), 0u);
}

TEST_F(LocalPortTest, MayBeDestroyedByItsReceiveHandler) {
  int calls = 0;
  std::unique_ptr<LocalPort> fragile;
  fragile = ports.createLocalPort("fragile", [&](MessageId, std::span<const std::uint8_t> data) {
    ++calls;
    fragile.reset();
    return std::optional<Bytes>(Bytes(data.begin(), data.end()));
  });
  fragile->setInvalidationHandler([&] { calls += 100; });
  RawSocket peer = RawSocket::connectTo(directory + "/fragile");
  peer.write(frame(2, 0, 1, bytesOf("first")));
  peer.write(frame(2, 0, 2, bytesOf("second")));
  EXPECT_TRUE(runUntil([&] { return calls > 0; }));
  runWhatIsDue();
  EXPECT_EQ(calls, 1);
  EXPECT_EQ(peer.readToEnd(), Bytes());
}

TEST_F(LocalPortTest, MayBeDestroyedByItsInvalidationHandler) {
  int calls = 0;
  port->setInvalidationHandler([&] {
    port.reset();
    ++calls;
  });
  port->invalidate();
  EXPECT_EQ(calls, 1);
  EXPECT_EQ(port, nullptr);
}

TEST_F(LocalPortTest, RunsItsInvalidationHandlerOnceFromWithinInvalidate) {
  int calls = 0;
  port->setInvalidationHandler([&] { ++calls; });
  port->invalidate();
  port->invalidate();
  EXPECT_EQ(calls, 1);
  EXPECT_FALSE(port->isValid());
}

TEST_F(LocalPortTest, IsSilentWhenTheHandlerIsRemovedOrThePortDestroyed) {
  int calls = 0;
  const auto destroyed = ports.createLocalPort("destroyed", echo());
  destroyed->setInvalidationHandler([&] { ++calls; });
  port->setInvalidationHandler([&] { ++calls; });
  port->setInvalidationHandler({});
  port->invalidate();
  EXPECT_EQ(calls, 0);
}

TEST_F(LocalPortTest, RefusesANameThatIsTaken) {
  EXPECT_EQ(ports.createLocalPort("port", echo()), nullptr);
  EXPECT_EQ(log.errors().size(), 1u);
  RawSocket peer = connect();
  peer.write(frame(1, 0, 0, bytesOf("mine")));
  EXPECT_TRUE(runUntilReceived(1));
}

TEST_F(LocalPortTest, RefusesANameThatAStoppedProcessHolds) {
  Spawned holder({"receive", "held"});
  ASSERT_EQ(holder.line(), "ready");
  holder.stop();
  EXPECT_EQ(ports.createLocalPort("held", echo()), nullptr);
  EXPECT_TRUE(std::filesystem::exists(directory + "/held"));
}

TEST_F(LocalPortTest, ReplacesTheSocketOfADeadProcess) {
  Spawned holder({"receive", "held"});
  ASSERT_EQ(holder.line(), "ready");
  holder.kill();
  EXPECT_TRUE(std::filesystem::exists(directory + "/held"));
  EXPECT_NE(ports.createLocalPort("held", echo()), nullptr);
}

TEST_F(LocalPortTest, LeavesAFileAloneThatIsNoSocket) {
  std::filesystem::create_directory(directory + "/other");
  EXPECT_EQ(ports.createLocalPort("other", echo()), nullptr);
  EXPECT_TRUE(std::filesystem::exists(directory + "/other"));
}

TEST_F(LocalPortTest, RemovesItsSocketWhenItIsClosed) {
  EXPECT_TRUE(std::filesystem::exists(directory + "/port"));
  port->invalidate();
  EXPECT_FALSE(std::filesystem::exists(directory + "/port"));
}

TEST_F(LocalPortTest, LeavesTheSocketOfItsSuccessorAlone) {
  std::filesystem::remove(directory + "/port");
  const auto successor = ports.createLocalPort("port", echo());
  port.reset();
  EXPECT_TRUE(std::filesystem::exists(directory + "/port"));
}

}  // namespace
}  // namespace kelvasi::test
