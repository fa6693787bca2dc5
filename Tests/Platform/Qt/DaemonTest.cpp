// SPDX-License-Identifier: Apache-2.0
// The daemon's server and an application's connection to it.
#include <cerrno>
#include <csignal>
#include <fstream>
#include <thread>

#include "Platform/Qt/QtDaemonServerHost.h"
#include "Platform/Qt/QtTelephonyDaemon.h"
#include "Tests/Platform/Qt/PortTest.h"
#include "Tests/Platform/Qt/RawSocket.h"
#include "Tests/Platform/Qt/Spawned.h"

namespace kelvasi::test {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

class DaemonTest : public PortTest {
 protected:
  std::unique_ptr<DaemonConnection> connect() {
    return daemon.connect([this](std::string_view text) { notifications.emplace_back(text); });
  }
  LogChannelAnswer answerTo(const std::string& name) {
    const auto connection = connect();
    return connection ? connection->createNetworkMonitorLogChannel(name) : LogChannelAnswer{};
  }
  // Of a server whose bytes are typed: the request is read, then these are sent.
  LogChannelAnswer answerToRaw(const Bytes& bytes) {
    RawListener listener(directory + "/telvon");
    const auto connection = connect();
    std::jthread answering([&] {
      RawSocket peer = listener.accept();
      peer.read(16 + 4);
      peer.write(bytes);
    });
    const LogChannelAnswer answer = connection->createNetworkMonitorLogChannel("port");
    std::filesystem::remove(directory + "/telvon");
    return answer;
  }

  QtTelephonyDaemon daemon{log, 30s};  // so that a busy machine fails no test
  QtDaemonServerHost host{log};
  std::vector<std::string> notifications;
};

TEST_F(DaemonTest, AnswersWithItsPortsName) {
  Spawned server({"daemon", "Daemon.port"});
  ASSERT_EQ(server.line(), "ready");
  const LogChannelAnswer answer = answerTo("KelvasiApp.1");
  EXPECT_EQ(answer.error.code, 0);
  EXPECT_EQ(answer.portName, "Daemon.port");
  EXPECT_EQ(server.line(), "asked KelvasiApp.1");
}

TEST_F(DaemonTest, AnswersWithItsError) {
  Spawned server({"daemon", "", "2", "-7"});
  ASSERT_EQ(server.line(), "ready");
  const LogChannelAnswer answer = answerTo("KelvasiApp.1");
  EXPECT_EQ(answer.error.domain, 2);
  EXPECT_EQ(answer.error.code, -7);
  EXPECT_FALSE(answer.portName);
}

TEST_F(DaemonTest, IsGivenUpWhenItDoesNotAnswer) {
  Spawned server({"daemon", "Daemon.port"});
  ASSERT_EQ(server.line(), "ready");
  QtTelephonyDaemon impatient(log);
  const auto connection = impatient.connect({});
  EXPECT_EQ(connection->createNetworkMonitorLogChannel("unanswered").error.code, ETIMEDOUT);
  server.stop();
  const LogChannelAnswer answer = connection->createNetworkMonitorLogChannel("KelvasiApp.1");
  EXPECT_EQ(answer.error.domain, posixErrorDomain);
  EXPECT_EQ(answer.error.code, ETIMEDOUT);
}

TEST_F(DaemonTest, IsMissedWhenThereIsNone) {
  EXPECT_EQ(connect(), nullptr);
  EXPECT_THAT(log.errors(), testing::IsEmpty());
}

TEST_F(DaemonTest, MayGoAwayInsteadOfAnswering) {
  EXPECT_EQ(answerToRaw({}).error.code, ECONNRESET);
}

TEST_F(DaemonTest, MayGoAwayBeforeItIsAsked) {
  Spawned server({"daemon", "Daemon.port"});
  ASSERT_EQ(server.line(), "ready");
  const auto connection = connect();
  server.kill();
  EXPECT_EQ(connection->createNetworkMonitorLogChannel("port").error.code, ECONNRESET);
}

TEST_F(DaemonTest, MayAnswerNonsense) {
  EXPECT_EQ(answerToRaw(frame(6, 0, 1, Bytes(7))).error.code, EPROTO);
  EXPECT_EQ(answerToRaw(frame(6, 0, 1, Bytes(8 + 256))).error.code, EPROTO);
  EXPECT_EQ(answerToRaw(frame(3, 0, 1, {})).error.code, EPROTO);
  EXPECT_EQ(answerToRaw(Bytes(16)).error.code, EPROTO);
  EXPECT_EQ(log.errors().size(), 4u);
}

TEST_F(DaemonTest, ReadsAnAnswerTypedByHand) {
  const LogChannelAnswer answer =
      answerToRaw({0x0a, 0, 0, 0, 1,    6,    0,    0,    0,   0,  0, 0, 1, 0, 0, 0,  //
                   2,    0, 0, 0, 0xf9, 0xff, 0xff, 0xff, 'o', 'k'});
  EXPECT_EQ(answer.error.domain, 2);
  EXPECT_EQ(answer.error.code, -7);
  EXPECT_EQ(answer.portName, "ok");
}

TEST_F(DaemonTest, TellsConnectedApplications) {
  const auto server = host.serve([](std::string_view) { return std::nullopt; });
  const auto one = connect();
  const auto other = connect();
  runWhatIsDue();
  server->notify("registration changed");
  EXPECT_TRUE(runUntil([this] { return notifications.size() == 2; }));
  EXPECT_THAT(notifications, ElementsAre("registration changed", "registration changed"));
}

TEST_F(DaemonTest, KeepsNotificationsOfTheWaitForTheEventLoop) {
  Spawned server({"daemon", "Daemon.port"});
  ASSERT_EQ(server.line(), "ready");
  const auto connection = connect();
  EXPECT_EQ(connection->createNetworkMonitorLogChannel("port").error.code, 0);
  EXPECT_THAT(notifications, testing::IsEmpty());
  EXPECT_TRUE(runUntil([this] { return !notifications.empty(); }));
  EXPECT_THAT(notifications, ElementsAre("asked"));
}

TEST_F(DaemonTest, IsSilentForADestroyedConnection) {
  Spawned server({"daemon", "Daemon.port"});
  ASSERT_EQ(server.line(), "ready");
  answerTo("port");
  runWhatIsDue();
  EXPECT_THAT(notifications, testing::IsEmpty());
}

TEST_F(DaemonTest, LetsANotificationDestroyItsConnection) {
  const auto server = host.serve([](std::string_view) { return std::nullopt; });
  std::unique_ptr<DaemonConnection> connection;
  int calls = 0;
  connection = daemon.connect([&](std::string_view) {
    connection.reset();
    ++calls;
  });
  runWhatIsDue();
  server->notify("one");
  server->notify("two");
  EXPECT_TRUE(runUntil([&] { return calls > 0; }));
  runWhatIsDue();
  EXPECT_EQ(calls, 1);
}

TEST_F(DaemonTest, LetsARequestDestroyTheServer) {
  std::unique_ptr<DaemonServer> server;
  server = host.serve([&](std::string_view) {
    server.reset();
    return LogChannelAnswer{};
  });
  RawSocket peer = RawSocket::connectTo(directory + "/telvon");
  peer.write(frame(5, 0, 1, bytesOf("port")));
  EXPECT_TRUE(runUntil([&] { return server == nullptr; }));
  EXPECT_EQ(peer.readToEnd(), Bytes());
}

TEST_F(DaemonTest, ClosesApplicationsThatAskNonsense) {
  const auto server = host.serve([](std::string_view) { return LogChannelAnswer{}; });
  for (const Bytes& nonsense : {frame(5, 0, 1, {}), frame(5, 0, 1, Bytes(256, 'n')), frame(1, 0, 0, {})}) {
    RawSocket peer = RawSocket::connectTo(directory + "/telvon");
    peer.write(nonsense);
    log.clear();
    EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
    EXPECT_THAT(log.errors(),
                ElementsAre("telvon: frame of a kind or size that has no place here; connection closed"));
    EXPECT_EQ(peer.readToEnd(), Bytes());
  }
}

TEST_F(DaemonTest, TakesPortNamesOf255Bytes) {
  std::string asked;
  auto server = host.serve([&](std::string_view name) {
    asked = name;
    return LogChannelAnswer{};
  });
  RawSocket peer = RawSocket::connectTo(directory + "/telvon");
  peer.write(frame(5, 0, 1, Bytes(255, 'n')));
  EXPECT_TRUE(runUntil([&] { return !asked.empty(); }));
  EXPECT_EQ(asked, std::string(255, 'n'));
  Bytes answer(8 + 255);
  std::fill(answer.begin() + 8, answer.end(), std::uint8_t{'p'});
  server.reset();
  EXPECT_EQ(answerToRaw(frame(6, 0, 1, answer)).portName, std::string(255, 'p'));
}

// A server whose bytes are typed, and an application that stays connected to it.
class TypedNotifications : public DaemonTest {
 protected:
  RawListener listener{directory + "/telvon"};
  std::unique_ptr<DaemonConnection> connection = connect();
  RawSocket server = listener.accept();
};

TEST_F(TypedNotifications, MayHave4096Bytes) {
  server.write(frame(7, 0, 0, Bytes(4096, 'n')));
  EXPECT_TRUE(runUntil([this] { return !notifications.empty(); }));
  EXPECT_THAT(notifications, ElementsAre(std::string(4096, 'n')));
  server.write(frame(7, 0, 0, Bytes(4097, 'n')));
  EXPECT_TRUE(runUntil([this] { return !log.errors().empty(); }));
  EXPECT_THAT(log.errors(),
              ElementsAre("telvon: frame of a kind or size that has no place here; connection closed"));
  EXPECT_EQ(notifications.size(), 1u);
}

TEST_F(TypedNotifications, WaitUpTo64AtATime) {
  for (const int count : {64, 65}) {
    notifications.clear();
    for (int number = 0; number < count; ++number) server.write(frame(7, 0, 0, {}));
    server.write(frame(6, 0, count == 64 ? 1 : 2, Bytes(8)));
    EXPECT_EQ(connection->createNetworkMonitorLogChannel("port").error.code, 0);
    runWhatIsDue();
    EXPECT_EQ(notifications.size(), 64u);
  }
}

TEST_F(DaemonTest, RefusesToBeTheSecond) {
  const auto first = host.serve([](std::string_view) { return std::nullopt; });
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(host.serve([](std::string_view) { return std::nullopt; }), nullptr);
  EXPECT_EQ(log.errors().size(), 1u);
  EXPECT_NE(connect(), nullptr);
}

TEST_F(DaemonTest, TakesThePlaceOfADeadOneAndTidiesUp) {
  Spawned server({"daemon", "Daemon.port"});
  Spawned port({"receive", "KelvasiApp.left"});
  const Spawned living({"receive", "KelvasiApp.living"});
  for (Spawned* spawned : {&server, &port}) {
    ASSERT_EQ(spawned->line(), "ready");
    spawned->kill();
  }
  std::ofstream(directory + "/note") << "no socket";
  const auto successor = host.serve([](std::string_view) { return std::nullopt; });
  EXPECT_NE(successor, nullptr);
  EXPECT_FALSE(std::filesystem::exists(directory + "/KelvasiApp.left"));
  EXPECT_TRUE(std::filesystem::exists(directory + "/telvon"));  // its own
  EXPECT_TRUE(std::filesystem::exists(directory + "/note"));
}

TEST_F(DaemonTest, LeavesNoSocketBehind) {
  host.serve([](std::string_view) { return std::nullopt; }).reset();
  EXPECT_FALSE(std::filesystem::exists(directory + "/telvon"));
}

TEST_F(DaemonTest, LeaksNoDescriptorInTwoHundredRounds) {
  const auto openDescriptors = [] {
    const std::filesystem::directory_iterator all("/proc/self/fd");
    return std::distance(begin(all), end(all));
  };
  const auto server = host.serve(
      [](std::string_view name) { return LogChannelAnswer{.error = {}, .portName = std::string(name)}; });
  runWhatIsDue();
  const auto before = openDescriptors();
  for (int round = 0; round < 200; ++round) {
    const auto local = ports.createLocalPort("local", [](auto, auto) { return std::nullopt; });
    const auto remote = ports.createRemotePort("local");
    const auto connection = connect();
    ASSERT_TRUE(local && remote && connection);
    remote->sendNow(0, bytesOf("hello"));
    runWhatIsDue();
  }
  runWhatIsDue();
  EXPECT_EQ(openDescriptors(), before);
}

}  // namespace
}  // namespace kelvasi::test
