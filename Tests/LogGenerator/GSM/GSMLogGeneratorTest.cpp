#include "LogGenerator/GSM/GSMLogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "Telvon/Technology.h"
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
  EXPECT_THAT(failureOf(one("A", 1)), HasSubstr("Unknown object of type number encountered"));
  EXPECT_THAT(failureOf(one("A", 0.5)), HasSubstr("Unknown object of type number encountered"));
  EXPECT_THAT(failureOf(PlistArray::make({true})), HasSubstr("Unknown object of type boolean encountered"));
  EXPECT_THAT(failureOf(Bytes{1}), HasSubstr("Unknown object of type data encountered"));
  EXPECT_THAT(failureOf(PlistDate{}), HasSubstr("Unknown object of type date encountered"));
}

}  // namespace
}  // namespace kelvasi
