// SPDX-License-Identifier: Apache-2.0
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"
#include "Tests/Support/ModelFixture.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

class Session : public testing::Test, protected test::ModelFixture {
 protected:
  // The attempt fails with these lines, and only 5 s later is there another.
  void expectRetryAfter(const std::vector<std::string>& lines) {
    model.startMonitor();
    EXPECT_EQ(errors(), lines);
    EXPECT_FALSE(model.isConnected());
    EXPECT_FALSE(*link.localValid);
    EXPECT_FALSE(*link.remoteValid);
    const auto attempts = link.localPortNames.size();
    queue.advance(4999ms);
    EXPECT_EQ(link.localPortNames.size(), attempts);
    queue.advance(1ms);
    EXPECT_EQ(link.localPortNames.size(), attempts + 1);
    queue.advance(50s);
    EXPECT_EQ(link.localPortNames.size(), attempts + 11);
  }
  static std::string text(const Bytes& bytes) { return {bytes.begin(), bytes.end()}; }
};

const std::string createdPorts = " ***** Created ports (send=<ptr>, recv=<ptr>)";
const std::string noPorts = "Could not create the ports necessary";
const std::string noGenerator = "No log generator technology works";

TEST_F(Session, OpensTheChannelAsksForTheTechnologyAndStarts) {
  model.restartMonitor();
  EXPECT_TRUE(model.isConnected());
  EXPECT_THAT(link.localPortNames, ElementsAre("KelvasiApp.UUID"));
  EXPECT_THAT(link.channelPortNames, ElementsAre("KelvasiApp.UUID"));
  EXPECT_THAT(link.remotePortNames, ElementsAre("daemon's port"));
  EXPECT_EQ(link.connectionsAtRemotePort, 0);
  ASSERT_EQ(link.sent.size(), 2u);
  EXPECT_EQ(text(link.sent[0].data), "GetTechnology");
  EXPECT_EQ(text(link.sent[1].data), "SetStateSetOrvaneLogCodesSetTelvonExtraCodes");
  EXPECT_THAT(errors(), ElementsAre(createdPorts, "Creating Orvane_GSMLogGenerator object",
                                    "Creating OrvaneLogGenerator2 object with <ptr>", "Class Index: 1",
                                    "Got log generated: <ptr>", "Starting the display update timer"));
}

TEST_F(Session, SendsItsCommandsWithTheStatedTimeouts) {
  model.startMonitor();
  EXPECT_EQ(link.sent[0].id, 0u);
  EXPECT_EQ(link.sent[0].sendTimeout, 1000ms);
  EXPECT_EQ(link.sent[0].receiveTimeout, 1000ms);
  EXPECT_EQ(link.sent[0].reply, RemotePort::Reply::awaited);
  EXPECT_EQ(link.sent[1].id, 0u);
  EXPECT_EQ(link.sent[1].sendTimeout, 1000ms);
  EXPECT_EQ(link.sent[1].receiveTimeout, 0ms);
  EXPECT_EQ(link.sent[1].reply, RemotePort::Reply::none);
}

TEST_F(Session, ConfiguringWithoutAPortFailsAsWithADeadOne) {
  model.configureGenerator();
  EXPECT_THAT(errors(), ElementsAre(" ***** Could not send the GetTechnology command (got error=-3)"));
  EXPECT_EQ(model.logGenerator(), nullptr);
}

TEST_F(Session, PortsThatAreMadeAgainReplaceThoseThatAreThere) {
  ASSERT_TRUE(model.createPorts());
  const auto firstLocal = link.localValid;
  const auto firstRemote = link.remoteValid;
  surroundings.log.clear();
  ASSERT_TRUE(model.createPorts());
  EXPECT_FALSE(*firstLocal);
  EXPECT_FALSE(*firstRemote);
  EXPECT_THAT(errors(), ElementsAre(createdPorts));
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, ASecondStartWhileTheTimerRunsDoesNothing) {
  model.startMonitor();
  model.startMonitor();
  EXPECT_EQ(link.localPortNames.size(), 1u);
}

TEST_F(Session, RetriesWithoutAnIdentifier) {
  link.identifier.reset();
  model.startMonitor();
  EXPECT_THAT(errors(), ElementsAre(noPorts));
  EXPECT_THAT(link.localPortNames, IsEmpty());
  link.identifier = "UUID";
  queue.advance(5s);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, RetriesWithoutADaemon) {
  link.daemonIsThere = false;
  expectRetryAfter({"Could not create TelvonServerConnection", noPorts});
}

TEST_F(Session, RetriesAfterAnErrorPair) {
  link.answer.error = {.domain = 1, .code = 49};
  expectRetryAfter({"_TelvonServerConnectionNetworkMonitorCreateLogChannel returns error: 49!", noPorts});
  EXPECT_EQ(link.openConnections, 0);
}

TEST_F(Session, RetriesAfterANullPort) {
  link.answer.portName.reset();
  expectRetryAfter({"Could not create a log channel (Telvon returned null port)!", noPorts});
}

TEST_F(Session, RetriesAfterAnEmptyPort) {
  link.answer.portName = "";
  expectRetryAfter({"Could not create a log channel (Telvon returned null port)!", noPorts});
}

TEST_F(Session, RetriesWhenNobodyListensOnTheDaemonsPort) {
  link.remotePortIsThere = false;
  expectRetryAfter({"Could not create the remote port!", noPorts});
}

TEST_F(Session, ALocalPortThatCannotBeMadeMakesTheChannelFailAndIsTriedAgain) {
  link.opensLocalPorts = false;
  expectRetryAfter({"_TelvonServerConnectionNetworkMonitorCreateLogChannel returns error: 22!", noPorts});
  link.opensLocalPorts = true;
  queue.advance(5s);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, RetriesWhenTheTechnologyCommandCannotBeMade) {
  plists.refused = Bytes{'G', 'e', 't', 'T', 'e', 'c', 'h', 'n', 'o', 'l', 'o', 'g', 'y'};
  expectRetryAfter(
      {createdPorts, " Could not generate GetTechnology command; cannot configure", noGenerator});
}

TEST_F(Session, RetriesWhenTheTechnologyCommandCannotBeSent) {
  link.technologyResult = {.status = SendStatus::receiveTimeout, .reply = std::nullopt};
  expectRetryAfter(
      {createdPorts, " ***** Could not send the GetTechnology command (got error=-2)", noGenerator});
}

TEST_F(Session, RetriesWithoutAReply) {
  link.technologyResult = {.status = SendStatus::success, .reply = std::nullopt};
  expectRetryAfter({createdPorts, " ***** No response to GetTechnology; cannot configure", noGenerator});
}

TEST_F(Session, RetriesAfterAReplyThatIsNoPropertyList) {
  link.technologyResult.reply = Bytes{'?'};
  expectRetryAfter(
      {createdPorts, " ***** Could not parse reply to GetTechnology; cannot configure", noGenerator});
}

TEST_F(Session, RetriesAfterAReplyWithoutAnAnswer) {
  answerWith(PlistDictionary::make({{"Something", "else"}}));
  expectRetryAfter(
      {createdPorts, " ***** Reply to GetTechnology had no answer; cannot configure", noGenerator});
}

TEST_F(Session, RetriesAfterAReplyThatIsNoDictionary) {
  answerWith("GetTechnology");
  expectRetryAfter(
      {createdPorts, " ***** Reply to GetTechnology had no answer; cannot configure", noGenerator});
}

TEST_F(Session, RetriesAfterAnUnknownTechnologyForEver) {
  answerTechnology("kTelvonLogChannelTechnology_Unheard");
  expectRetryAfter({createdPorts, "Got log generated: <ptr>", noGenerator});
}

TEST_F(Session, RetriesAfterATechnologyThatIsNoString) {
  answerTechnology(7);
  expectRetryAfter({createdPorts, "Got log generated: <ptr>", noGenerator});
}

TEST_F(Session, AnUnknownTechnologyTakesTheEarlierGeneratorAway) {
  model.startMonitor();
  ASSERT_NE(model.logGenerator(), nullptr);
  answerTechnology("kTelvonLogChannelTechnology_Unheard");
  model.restartMonitor();
  EXPECT_EQ(model.logGenerator(), nullptr);
}

TEST_F(Session, AReplyWithoutTheKeyKeepsTheEarlierGeneratorAndItsStartCommandIsSent) {
  model.startMonitor();
  const LogGenerator* const before = model.logGenerator();
  answerWith(PlistDictionary::make());
  surroundings.log.clear();
  model.restartMonitor();
  EXPECT_EQ(model.logGenerator(), before);
  EXPECT_TRUE(model.isConnected());
  EXPECT_EQ(text(link.sent.back().data), "SetStateSetOrvaneLogCodesSetTelvonExtraCodes");
  EXPECT_THAT(errors(),
              ElementsAre(createdPorts, " ***** Reply to GetTechnology had no answer; cannot configure",
                          "Starting the display update timer"));
}

TEST_F(Session, RetriesWhenTheStartCommandCannotBeMade) {
  const std::string keys = "SetStateSetOrvaneLogCodesSetTelvonExtraCodes";
  plists.refused = Bytes(keys.begin(), keys.end());
  model.startMonitor();
  EXPECT_EQ(errors().back(), " Could not generate PLIST");
  EXPECT_FALSE(model.isConnected());
  plists.refused.clear();
  queue.advance(5s);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, RetriesWhenTheStartCommandCannotBeSent) {
  link.startStatus = SendStatus::sendTimeout;
  model.startMonitor();
  EXPECT_EQ(errors().back(), " ***** Could not send the START command (got error=-1)");
  EXPECT_FALSE(model.isConnected());
  link.startStatus = SendStatus::success;
  queue.advance(5s);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, TellsOfTheTimerOnceTheStartCommandIsSent) {
  link.startStatus = SendStatus::sendTimeout;
  model.startMonitor();
  EXPECT_THAT(errors(), Not(Contains("Starting the display update timer")));
}

TEST_F(Session, DropsMessagesWithAnotherIdSilently) {
  model.startMonitor();
  surroundings.log.clear();
  EXPECT_EQ(link.receive(1, test::record(0x7131, "13", 16)), std::nullopt);
  queue.advance(2s);
  EXPECT_EQ(updates, 0);
  EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Session, NeverRepliesToLogData) {
  model.startMonitor();
  EXPECT_EQ(link.receive(0, test::record(0x7131, "13", 16)), std::nullopt);
  queue.advance(2s);
  EXPECT_EQ(updates, 1);
}

TEST_F(Session, NoticesTheDaemonsDeathAtTheNextTickAndRestartsAtOnce) {
  model.startMonitor();
  surroundings.log.clear();
  *link.remoteValid = false;
  queue.advance(1999ms);
  EXPECT_EQ(link.localPortNames.size(), 1u);
  queue.advance(1ms);
  EXPECT_EQ(link.localPortNames.size(), 2u);
  EXPECT_TRUE(model.isConnected());
  EXPECT_EQ(errors().front(), " ***** INVALIDATED <ptr> *****");
  queue.advance(20s);
  EXPECT_EQ(link.localPortNames.size(), 2u);
}

TEST_F(Session, ADeathFoundWithTheDaemonGoneIsTriedAgainEvery5Seconds) {
  model.startMonitor();
  *link.remoteValid = false;
  link.daemonIsThere = false;
  queue.advance(2s);
  EXPECT_FALSE(model.isConnected());
  link.daemonIsThere = true;
  queue.advance(4999ms);
  EXPECT_FALSE(model.isConnected());
  queue.advance(1ms);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, ATickThatFindsTheDeathStillConsumesTheDataThatHadCome) {
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  *link.remoteValid = false;
  queue.advance(2s);
  EXPECT_EQ(updates, 1);
}

TEST_F(Session, ARestartKeepsTheStateAndItsRowsGoOnMoving) {
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  const LogGenerator* const before = model.logGenerator();
  *link.remoteValid = false;
  queue.advance(2s);
  ASSERT_NE(model.logGenerator(), before);
  EXPECT_EQ(*model.nodeAtPath("/Process CO/MM State")->value(), "MM_IDLE");
  link.receive(0, test::record(0x7131, "06", 16));
  queue.advance(2s);
  EXPECT_EQ(*model.nodeAtPath("/Process CO/MM State")->value(), "MM_CONNECTION_ACTIVE");
}

TEST_F(Session, AfterAChangeOfTechnologyTheOldDisplayStays) {
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  answerTechnology(kTelvonLogChannelTechnology_Orvane_LTE);
  resources.files["LTE.plist"] =
      plists.standFor(PlistDictionary::make({{"Serving Cell Info", PlistDictionary::make()}}));
  *link.remoteValid = false;
  queue.advance(2s);
  link.receive(0, test::record(0xB0C0, "", 40));
  queue.advance(2s);
  EXPECT_EQ(*model.nodeAtPath("/Process CO/MM State")->value(), "MM_IDLE");
  EXPECT_EQ(model.topLevelNodes()->childNodes()->size(), 2u);
}

constexpr const char* otherTechnology =
    "The display is that of another technology than the daemon's, and stays until a new start";

// The daemon comes back with another technology, whose template has a section of the same name and kind.
TEST_F(Session, AfterAChangeOfTechnologyNothingIsMixedAndTheLogSaysSoOnce) {
  surroundings.log.isMasked = false;
  resources.files["Orvane_GSM.plist"] =
      plists.standFor(PlistDictionary::make({{"Process CO", PlistDictionary::make()},
                                             {"RRC Info", PlistDictionary::make({{"State", "of before"}})}}));
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  queue.advance(2s);
  EXPECT_FALSE(model.showsAnotherTechnology());
  answerTechnology(kTelvonLogChannelTechnology_Orvane_UTRAN2);
  resources.files["UTRAN.plist"] =
      plists.standFor(PlistDictionary::make({{"RRC Info", PlistDictionary::make()}}));
  *link.remoteValid = false;
  queue.advance(2s);
  for (int tick = 0; tick < 3; ++tick) {
    link.receive(0, test::record(0xD0E0, "", 40));
    queue.advance(2s);
    EXPECT_EQ(*model.nodeAtPath("/RRC Info/State")->value(), "of before");
  }
  EXPECT_TRUE(model.showsAnotherTechnology());
  EXPECT_THAT(surroundings.log.lines(LogPriority::notice), ElementsAre(otherTechnology));
}

TEST_F(Session, ADisplayOfTheFirstTechnologyMovesOnWhenThatComesBack) {
  surroundings.log.isMasked = false;
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  for (const auto technology : {kTelvonLogChannelTechnology_IFX, kTelvonLogChannelTechnology_Orvane_GSM}) {
    answerTechnology(technology);
    *link.remoteValid = false;
    queue.advance(2s);
    EXPECT_EQ(*model.nodeAtPath("/Process CO/MM State")->value(), "MM_IDLE");
  }
  link.receive(0, test::record(0x7131, "06", 16));
  queue.advance(2s);
  EXPECT_EQ(*model.nodeAtPath("/Process CO/MM State")->value(), "MM_CONNECTION_ACTIVE");
  EXPECT_FALSE(model.showsAnotherTechnology());
}

TEST_F(Session, RestartsWhenTheReceivePortIsInvalidatedFromOutside) {
  model.startMonitor();
  link.localPort->invalidate();
  EXPECT_EQ(link.localPortNames.size(), 2u);
  EXPECT_TRUE(model.isConnected());
}

TEST_F(Session, TearsTheReceivePortDownBeforeTheSendPort) {
  model.startMonitor();
  model.destroyPorts();
  EXPECT_THAT(link.invalidated, ElementsAre("receive", "send"));
}

// A daemon that opens a channel to nobody.
TEST_F(Session, WithoutAReceivePortATickTakesNoNoteOfTheDaemonsDeath) {
  link.opensLocalPorts = false;
  link.daemonRefusesNoName = false;
  model.startMonitor();
  EXPECT_FALSE(model.isConnected());
  *link.remoteValid = false;
  surroundings.log.clear();
  queue.advance(20s);
  EXPECT_EQ(link.localPortNames.size(), 1u);
  EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Session, NamesTheSendPortBeforeTheReceivePort) {
  ASSERT_TRUE(model.createPorts());
  char line[100];
  std::snprintf(line, sizeof line, " ***** Created ports (send=%p, recv=%p)",
                static_cast<void*>(link.remotePort), static_cast<void*>(link.localPort));
  EXPECT_EQ(surroundings.log.firstLine(), line);
}

TEST_F(Session, ItsOwnTearDownStartsNothingAgain) {
  model.startMonitor();
  model.destroyPorts();
  queue.advance(60s);
  EXPECT_EQ(link.localPortNames.size(), 1u);
  EXPECT_FALSE(model.isConnected());
}

TEST_F(Session, ANotificationOfTheDaemonIsATick) {
  model.startMonitor();
  link.receive(0, test::record(0x7131, "13", 16));
  link.notify("anything");
  queue.runPosted();
  EXPECT_EQ(updates, 1);
}

TEST_F(Session, ARetryThatWaitsWhenTheModelGoesNeverRuns) {
  {
    KelvasiModel passing({surroundings.log, surroundings.trace, plists, resources, surroundings.clock},
                         {queue, link, link}, [] {});
    link.daemonIsThere = false;
    passing.startMonitor();
  }
  queue.advance(60s);
  EXPECT_EQ(link.localPortNames.size(), 1u);
}

}  // namespace
}  // namespace kelvasi
