// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Telvon/Technology.h"
#include "Telvon/TechnologyName.h"
#include "Tests/Simulator/FakeApplication.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::record;
using test::getTechnology;
using testing::ElementsAre;
using testing::IsEmpty;

class SimulatedDaemon : public testing::Test {
 protected:
  SimulatedDaemon() { make({}); }

  void make(std::initializer_list<std::string_view> requests) {
    Faults faults;
    for (const auto request : requests) EXPECT_EQ(faults.add(request), "");
    server.reset();
    daemon.emplace(DaemonPlatform{surroundings.log, ports, plists}, kTelvonLogChannelTechnology_Orvane_GSM,
                   faults, [this](Channel& channel) { begun.push_back(channel.name()); });
    server = ports.serve([this](std::string_view port) { return daemon->openChannel(port); });
  }
  std::optional<PlistValue> answerOf(test::FakeApplication& application) {
    const SendResult result = application.ask(getTechnology());
    EXPECT_EQ(result.status, SendStatus::success);
    return result.reply ? plists.parse(*result.reply) : std::nullopt;
  }
  // The effective codes of what an application received.
  static std::vector<LogCode> codes(const test::FakeApplication& application) {
    std::vector<LogCode> found;
    for (const auto& message : application.received)
      found.push_back(logMessage(message.bytes).logCode.value_or(0));
    return found;
  }
  void send(std::initializer_list<LogCode> logCodes) {
    Messages messages;
    for (const LogCode code : logCodes) messages.push_back(logMessage(record(code, "")));
    daemon->send(messages);
    queue.runPosted();
  }

  kelvasi::test::TestPlatform surroundings;
  test::FakeMainQueue queue;
  test::FakePorts ports{queue};
  LibplistSerialiser plists;
  std::vector<std::string> begun;
  std::optional<Daemon> daemon;
  std::unique_ptr<DaemonServer> server;
  test::FakeApplication viewer{ports, "KelvasiApp.1"};
};

TEST_F(SimulatedDaemon, OpensAChannelWithAPortOfItsOwn) {
  viewer.connect();
  EXPECT_EQ(viewer.answered.error.code, 0);
  EXPECT_EQ(viewer.answered.portName, "telvon.log.uuid-1");
  EXPECT_TRUE(viewer.isConnected());
  EXPECT_EQ(daemon->channelCount(), 1u);
}

TEST_F(SimulatedDaemon, RefusesAChannelToAPortThatNobodyListensOn) {
  const auto answer = daemon->openChannel("KelvasiApp.nobody");
  ASSERT_TRUE(answer);
  EXPECT_NE(answer->error.code, 0);
  EXPECT_EQ(answer->portName, std::nullopt);
  EXPECT_EQ(daemon->channelCount(), 0u);
}

TEST_F(SimulatedDaemon, AnswersGetTechnology) {
  viewer.connect();
  EXPECT_EQ(answerOf(viewer),
            PlistValue(PlistDictionary::make({{"GetTechnology", "kTelvonLogChannelTechnology_Orvane_GSM"}})));
}

TEST_F(SimulatedDaemon, SendsNothingBeforeTheStartCommand) {
  viewer.connect();
  EXPECT_FALSE(daemon->isStreaming());
  send({0x7130});
  EXPECT_THAT(viewer.received, IsEmpty());
}

TEST_F(SimulatedDaemon, SendsWhatWasSubscribedToAndNothingElse) {
  viewer.connect();
  viewer.start({0x7130}, {1});
  EXPECT_THAT(begun, ElementsAre("telvon.log.uuid-1"));
  EXPECT_TRUE(daemon->isStreaming());
  send({0x7130, 0x7131, 0xFF0001, 0xFF0000, 0x0001});
  EXPECT_THAT(codes(viewer), ElementsAre(0x7130, 0xFF0001));
}

TEST_F(SimulatedDaemon, AStartCommandReplacesTheOneBefore) {
  viewer.connect();
  viewer.start({0x7130});
  viewer.start({0x7131});
  send({0x7130, 0x7131});
  EXPECT_THAT(codes(viewer), ElementsAre(0x7131));
}

TEST_F(SimulatedDaemon, AnotherStateEndsTheStream) {
  viewer.connect();
  viewer.start({0x7130});
  viewer.ask(PlistDictionary::make({{"SetState", "Idle"}}));
  send({0x7130});
  EXPECT_THAT(viewer.received, IsEmpty());
  EXPECT_FALSE(daemon->isStreaming());
}

TEST_F(SimulatedDaemon, ServesSeveralApplicationsEachWithItsOwnSubscription) {
  test::FakeApplication recorder{ports, "KelvasiApp.2"};
  viewer.connect();
  recorder.connect();
  viewer.start({0x7130});
  recorder.startEverything();
  send({0x7130, 0x7131});
  EXPECT_THAT(codes(viewer), ElementsAre(0x7130));
  EXPECT_THAT(codes(recorder), ElementsAre(0x7130, 0x7131));
}

TEST_F(SimulatedDaemon, ClosesAChannelWhenItsApplicationHasGone) {
  test::FakeApplication recorder{ports, "KelvasiApp.2"};
  viewer.connect();
  recorder.connect();
  viewer.startEverything();
  viewer.leave();
  EXPECT_FALSE(daemon->isStreaming());
  daemon->sweep();
  EXPECT_EQ(daemon->channelCount(), 1u);
  EXPECT_FALSE(viewer.isConnected());
  EXPECT_TRUE(recorder.isConnected());
}

TEST_F(SimulatedDaemon, AStalledApplicationLosesItsOwnMessagesOnly) {
  test::FakeApplication recorder{ports, "KelvasiApp.2"};
  ports.backlog = 3;
  for (auto* application : {&viewer, &recorder}) {
    application->connect();
    application->startEverything();
  }
  ports.stall(viewer.name);
  for (int turn = 0; turn < 10; ++turn) send({0x7130});
  EXPECT_EQ(recorder.received.size(), 10u);
  daemon->sweep();
  daemon->sweep();
  EXPECT_THAT(surroundings.log.warnings(),
              ElementsAre("telvon.log.uuid-1: 7 messages dropped, its application does not keep up"));
  ports.resume(viewer.name);
  queue.runPosted();
  EXPECT_EQ(viewer.received.size(), 3u);
  send({0x7130});
  EXPECT_EQ(viewer.received.size(), 4u);
}

TEST_F(SimulatedDaemon, IgnoresCommandsThatAreNone) {
  viewer.connect();
  EXPECT_EQ(viewer.ask("GetTechnology").reply, std::nullopt);
  EXPECT_EQ(viewer.ask(PlistDictionary::make({{"SetState", 1}})).reply, std::nullopt);
  EXPECT_EQ(viewer.ask(getTechnology(), 1).reply, std::nullopt);
  EXPECT_EQ(surroundings.log.errors().size(), 2u);
  EXPECT_FALSE(daemon->isStreaming());
}

TEST_F(SimulatedDaemon, ClosesAChannelWhenItsApplicationSendsNoCommandsAnyMore) {
  viewer.connect();
  viewer.startEverything();
  viewer.hangUp();
  queue.runPosted();
  EXPECT_FALSE(daemon->isStreaming());
  EXPECT_EQ(daemon->channelCount(), 0u);
  send({0x7130});
  EXPECT_THAT(viewer.received, IsEmpty());
}

TEST_F(SimulatedDaemon, KeepsAChannelWhileAnotherConnectionSendsItCommands) {
  viewer.connect();
  viewer.startEverything();
  test::FakeApplication second{ports, "KelvasiApp.2"};
  second.use(viewer.answered);
  second.ask(getTechnology());
  viewer.hangUp();
  queue.runPosted();
  EXPECT_EQ(daemon->channelCount(), 1u);
  second.hangUp();
  queue.runPosted();
  EXPECT_EQ(daemon->channelCount(), 0u);
}

TEST_F(SimulatedDaemon, RefusesTheChannelAfterTheLast) {
  for (std::size_t number = 0; number < 64; ++number)
    EXPECT_EQ(daemon->openChannel(viewer.name)->error.code, 0);
  EXPECT_THAT(surroundings.log.errors(), IsEmpty());
  const auto refused = daemon->openChannel(viewer.name);
  EXPECT_NE(refused->error.code, 0);
  EXPECT_EQ(refused->portName, std::nullopt);
  EXPECT_EQ(daemon->channelCount(), 64u);
  EXPECT_THAT(surroundings.log.errors(), ElementsAre("More than 64 channels; one refused"));
}

TEST_F(SimulatedDaemon, FaultNoAnswer) {
  make({"no-answer"});
  viewer.connect();
  const SendResult result = viewer.ask(getTechnology());
  EXPECT_EQ(result.status, SendStatus::success);
  EXPECT_EQ(result.reply, std::nullopt);
}

TEST_F(SimulatedDaemon, FaultAnswerWithoutKey) {
  make({"answer-without-key"});
  viewer.connect();
  const auto answer = answerOf(viewer);
  ASSERT_TRUE(answer && answer->dictionary());
  EXPECT_FALSE(answer->dictionary()->find("GetTechnology"));
}

TEST_F(SimulatedDaemon, FaultAnswerGarbage) {
  make({"answer-garbage"});
  viewer.connect();
  EXPECT_TRUE(viewer.ask(getTechnology()).reply);
  EXPECT_EQ(answerOf(viewer), std::nullopt);
}

TEST_F(SimulatedDaemon, FaultUnknownTechnology) {
  make({"unknown-technology"});
  viewer.connect();
  const PlistValue technology = answerOf(viewer)->dictionary()->get("GetTechnology");
  ASSERT_TRUE(technology.string());
  EXPECT_EQ(technologyId(*technology.string()), std::nullopt);
}

TEST_F(SimulatedDaemon, FaultNoChannel) {
  make({"no-channel"});
  EXPECT_EQ(daemon->openChannel(viewer.name), std::nullopt);
}

TEST_F(SimulatedDaemon, FaultErrorPair) {
  make({"error-pair=-35"});
  viewer.connect();
  EXPECT_EQ(viewer.answered.error.code, -35);
  EXPECT_EQ(viewer.answered.portName, std::nullopt);
}

TEST_F(SimulatedDaemon, FaultNullPort) {
  make({"null-port"});
  viewer.connect();
  EXPECT_EQ(viewer.answered.error.code, 0);
  EXPECT_EQ(viewer.answered.portName, std::nullopt);
}

TEST_F(SimulatedDaemon, FaultEmptyPort) {
  make({"empty-port"});
  viewer.connect();
  EXPECT_EQ(viewer.answered.error.code, 0);
  EXPECT_EQ(viewer.answered.portName, "");
}

TEST_F(SimulatedDaemon, FaultDeadPort) {
  make({"dead-port"});
  viewer.connect();
  ASSERT_TRUE(viewer.answered.portName);
  EXPECT_NE(*viewer.answered.portName, "");
  EXPECT_FALSE(ports.isListening(*viewer.answered.portName));
  EXPECT_FALSE(viewer.isConnected());
}

}  // namespace
}  // namespace kelvasi::sim
