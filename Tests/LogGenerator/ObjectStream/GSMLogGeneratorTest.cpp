// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ObjectStream/GSMLogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <csignal>

#include "LogGenerator/Exceptions.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/SystemLogs.h"
#include "Platform/Posix/TerminateHandler.h"
#include "Telvon/Technology.h"
#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using testing::HasSubstr;

PlistValue one(const std::string& key, PlistValue value) {
  return PlistDictionary::make({{key, std::move(value)}});
}

struct Stream {
  void take(PlistValue message) {
    generator.updateState(state, surroundings.plists.standFor(std::move(message)));
  }

  test::TestPlatform surroundings;
  GSMLogGenerator generator{surroundings.platform()};
  PlistDictionary state;
};

std::string failureOf(const PlistValue& object) {
  try {
    GSMLogGenerator::processObject(object);
  } catch (const AssertionFailure& failure) {
    return failure.what();
  }
  return "no failure";
}

TEST(GSMLogGenerator, IsTheGeneratorOfItsTechnology) {
  test::TestPlatform surroundings;
  const auto generator =
      LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_IFX, surroundings.platform());
  EXPECT_NE(dynamic_cast<GSMLogGenerator*>(generator.get()), nullptr);
}

TEST(GSMLogGenerator, ADictionaryOfOneEntryIsReplacedByItsValue) {
  EXPECT_EQ(GSMLogGenerator::processObject(one("A", one("B", "x"))), one("A", "x"));
}

TEST(GSMLogGenerator, AChainCollapsesLevelByLevel) {
  EXPECT_EQ(GSMLogGenerator::processObject(one("A", one("B", one("C", "x")))), one("A", "x"));
}

TEST(GSMLogGenerator, ADictionaryOfTwoEntriesStays) {
  const PlistValue two = one("A", PlistDictionary::make({{"B", "x"}, {"C", "y"}}));
  EXPECT_EQ(GSMLogGenerator::processObject(two), two);
}

TEST(GSMLogGenerator, TheTopNeverCollapses) {
  EXPECT_EQ(GSMLogGenerator::processObject(one("A", "x")), one("A", "x"));
}

TEST(GSMLogGenerator, AnElementOfOneEntryIsReplacedByItsValue) {
  EXPECT_EQ(GSMLogGenerator::processObject(PlistArray::make({one("A", "x"), PlistDictionary::make(), "y"})),
            PlistValue(PlistArray::make({"x", PlistDictionary::make(), "y"})));
}

TEST(GSMLogGenerator, StatesItsRuleAsAnOperation) {
  EXPECT_EQ(GSMLogGenerator::canCollapse(one("A", "x")), PlistValue("x"));
  EXPECT_TRUE(GSMLogGenerator::canCollapse(PlistDictionary::make()).isAbsent());
  EXPECT_TRUE(GSMLogGenerator::canCollapse(PlistDictionary::make({{"A", "x"}, {"B", "y"}})).isAbsent());
  EXPECT_TRUE(GSMLogGenerator::canCollapse(PlistArray::make({"x"})).isAbsent());
  EXPECT_TRUE(GSMLogGenerator::canCollapse("x").isAbsent());
}

TEST(GSMLogGenerator, EachMessageReplacesTheDisplayWholesale) {
  Stream stream;
  stream.take(PlistDictionary::make({{"A", "x"}, {"B", "y"}}));
  stream.take(one("C", one("D", "z")));
  EXPECT_EQ(stream.generator.generateLogUsingState(stream.state), one("C", "z"));
  EXPECT_EQ(stream.state.get("DisplayState"), one("C", one("D", "z")));
  EXPECT_EQ(stream.state.get("ExtraInfo"), PlistValue(PlistDictionary::make()));
}

TEST(GSMLogGenerator, ATickWithoutAMessageShowsTheLastDisplayAgainAndAddsAHistoryEntry) {
  Stream stream;
  stream.take(one("A", "x"));
  stream.generator.generateLogUsingState(stream.state);
  EXPECT_EQ(stream.generator.generateLogUsingState(stream.state), one("A", "x"));
  EXPECT_EQ(stream.state.find("History")->array()->size(), 2u);
}

TEST(GSMLogGenerator, WithoutAMessageThereIsNoDisplay) {
  Stream stream;
  EXPECT_TRUE(stream.generator.generateLogUsingState(stream.state).isAbsent());
}

TEST(GSMLogGenerator, OwnsADisplayOnceAMessageMadeIt) {
  Stream stream;
  EXPECT_TRUE(stream.generator.ownsDisplay(stream.state));
  stream.state.set("Display", one("Section", "of an Orvane technology"));
  EXPECT_FALSE(stream.generator.ownsDisplay(stream.state));
  stream.state.set("DisplayState", Bytes{1, 2});
  EXPECT_FALSE(stream.generator.ownsDisplay(stream.state));
  stream.take(one("A", "x"));
  EXPECT_TRUE(stream.generator.ownsDisplay(stream.state));
}

TEST(GSMLogGenerator, SavesTheHistoryAlone) {
  Stream stream;
  EXPECT_TRUE(stream.generator.getSaveContentsFromState(stream.state).array()->empty());
  stream.take(one("A", "x"));
  stream.generator.generateLogUsingState(stream.state);
  const PlistValue contents = stream.generator.getSaveContentsFromState(stream.state);
  ASSERT_EQ(contents.array()->size(), 1u);
  EXPECT_EQ(contents.array()->at(0).dictionary()->get("DisplayState"), one("A", "x"));
}

TEST(GSMLogGenerator, StartCommandNamesNoLogCodes) {
  const Stream stream;
  EXPECT_EQ(stream.generator.getStartCommand(), one("SetState", "Streaming"));
}

TEST(GSMLogGenerator, EveryMessageHasExtraInformationOfItsOwn) {
  Stream stream;
  stream.take(one("A", "x"));
  const PlistValue first = stream.state.get("ExtraInfo");
  first.dictionary()->set("kept", "no");
  stream.take(one("A", "x"));
  EXPECT_TRUE(stream.state.get("ExtraInfo").dictionary()->empty());
}

TEST(GSMLogGenerator, AListAtTheTopIsSimplifiedInside) {
  EXPECT_EQ(GSMLogGenerator::processObject(PlistArray::make({one("A", PlistArray::make({one("B", "x")}))})),
            PlistValue(PlistArray::make({PlistArray::make({"x"})})));
  EXPECT_EQ(GSMLogGenerator::processObject("text"), PlistValue("text"));
}

TEST(GSMLogGenerator, WhatWasReceivedStaysAsItWas) {
  const PlistValue message = one("A", one("B", "x"));
  GSMLogGenerator::processObject(message);
  EXPECT_EQ(message, one("A", one("B", "x")));
}

TEST(GSMLogGenerator, AMessageThatFailsChangesNothing) {
  Stream stream;
  stream.take(one("A", "x"));
  EXPECT_THROW(stream.take(one("A", 1)), AssertionFailure);
  EXPECT_EQ(stream.generator.generateLogUsingState(stream.state), one("A", "x"));
  EXPECT_EQ(stream.state.get("DisplayState"), one("A", "x"));
}

// As in the program: nothing catches what the handler of a message throws.
void endWith(const PlistValue& message) {
  static StderrSystemLog log{LogLevel("crit")};
  installTerminateHandler(log);
  [&]() noexcept {
    Stream stream;
    if (message.isAbsent()) stream.generator.updateState(stream.state, test::hex("3F"));
    stream.take(message);
  }();
}

TEST(GSMLogGeneratorDeathTest, BothFailedAssertionsEndTheProcessWithTheirTexts) {
  const auto aborted = testing::KilledBySignal(SIGABRT);
  EXPECT_EXIT(endWith({}), aborted,
              "^<2>Terminating: uncaught kelvasi::AssertionFailure: Could not deserialize the object "
              "\\(assertion in LogGenerator/GSM/GSMLogGenerator\\)\n$");
  EXPECT_EXIT(endWith(one("A", PlistArray::make({"x", one("B", 7)}))), aborted,
              "^<2>Terminating: uncaught kelvasi::AssertionFailure: Unknown object of type int encountered "
              "\\(assertion in LogGenerator/GSM/GSMLogGenerator\\)\n$");
}

// Messages as they come, cut and changed at every byte: each is shown or fails as an assertion does.
struct RealStream {
  Platform platform() {
    return {surroundings.log, surroundings.trace, plists, surroundings.resources, surroundings.clock};
  }
  bool isShown(Bytes message) {
    message.shrink_to_fit();
    PlistDictionary state;
    try {
      GSMLogGenerator(platform()).updateState(state, message);
    } catch (const AssertionFailure&) {
      return false;
    }
    return state.find("Display") != nullptr;
  }

  test::TestPlatform surroundings;
  LibplistSerialiser plists;
};

const PlistValue sample =
    PlistDictionary::make({{"Cell", one("GSM", PlistDictionary::make({{"ARFCN", "24"}, {"BSIC", "7"}}))},
                           {"Neighbors", PlistArray::make({one("ARFCN", "28"), PlistDictionary::make()})}});

TEST(GSMLogGeneratorSweep, CutMessagesAreShownOrFail) {
  RealStream stream;
  const Bytes xml = *stream.plists.serialiseXml(sample);
  const Bytes binary = *stream.plists.serialiseBinary(sample);
  for (const Bytes& whole : {xml, binary}) {
    EXPECT_TRUE(stream.isShown(whole));
    for (std::size_t length = 0; length + 16 < whole.size(); ++length)
      EXPECT_FALSE(stream.isShown({whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)}));
  }
}

TEST(GSMLogGeneratorSweep, ChangedMessagesAreShownOrFail) {
  RealStream stream;
  int shown = 0;
  int failed = 0;
  const Bytes xml = *stream.plists.serialiseXml(sample);
  const Bytes binary = *stream.plists.serialiseBinary(sample);
  for (const Bytes& whole : {xml, binary}) {
    for (std::size_t at = 0; at < whole.size(); ++at) {
      for (const int change : {0x01, 0x10, 0x80, 0xFF}) {
        Bytes changed = whole;
        changed[at] = static_cast<std::uint8_t>(changed[at] ^ change);
        ++(stream.isShown(changed) ? shown : failed);
      }
    }
  }
  EXPECT_GT(shown, 100);
  EXPECT_GT(failed, 100);
}

TEST(GSMLogGeneratorSweep, AsDeepAsAPropertyListMayBe) {
  RealStream stream;
  PlistValue value = "x";
  for (int level = 0; level < 128; ++level) value = one("A", value);
  EXPECT_TRUE(stream.isShown(*stream.plists.serialiseXml(value)));
  EXPECT_EQ(GSMLogGenerator::processObject(value), one("A", "x"));
}

TEST(GSMLogGenerator, AMessageThatIsNoPropertyListIsAFailedAssertion) {
  Stream stream;
  EXPECT_THROW(stream.generator.updateState(stream.state, Bytes{'?'}), AssertionFailure);
  try {
    stream.generator.updateState(stream.state, Bytes{'?'});
  } catch (const AssertionFailure& failure) {
    EXPECT_THAT(failure.what(), HasSubstr("Could not deserialize the object"));
    EXPECT_THAT(failure.what(), HasSubstr("LogGenerator/GSM/GSMLogGenerator"));
  }
}

TEST(GSMLogGenerator, AValueThatIsNeitherTextNorContainerIsAFailedAssertion) {
  EXPECT_THAT(failureOf(one("A", 1)), HasSubstr("Unknown object of type int encountered"));
  EXPECT_THAT(failureOf(one("A", 0.5)), HasSubstr("Unknown object of type double encountered"));
  EXPECT_THAT(failureOf(PlistArray::make({true})), HasSubstr("Unknown object of type bool encountered"));
  EXPECT_THAT(failureOf(Bytes{1}), HasSubstr("Unknown object of type bytes encountered"));
  EXPECT_THAT(failureOf(PlistDate{}), HasSubstr("Unknown object of type date encountered"));
}

}  // namespace
}  // namespace kelvasi
