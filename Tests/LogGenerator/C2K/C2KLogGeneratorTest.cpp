// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/C2KLogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/C2K/C2KLookup.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/C2K/C2KFixture.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/LogGenerator/C2K/Required.h"

namespace kelvasi {
namespace {

using test::C2KFixture;
using test::hex;
using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

// An EV-DO active set without pilots.
Bytes emptyActiveSet() {
  return record(0x12B6, "", 25);
}

TEST(C2KLogGenerator, IsTheGeneratorOfItsTechnology) {
  test::TestPlatform surroundings;
  const auto generator =
      LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_Orvane_CDMA, surroundings.platform());
  EXPECT_NE(dynamic_cast<C2KLogGenerator*>(generator.get()), nullptr);
}

TEST(C2KLogGenerator, TheStartCommandNamesTheCodeOfEveryRecordInOrder) {
  const C2KFixture fixture({});
  const auto codes = PlistArray::make();
  for (const C2KRecord& each : c2kRecords()) codes->append(each.logCode);
  EXPECT_EQ(fixture.generator.getStartCommand(),
            PlistValue(PlistDictionary::make({{"SetState", "Streaming"}, {"SetOrvaneLogCodes", codes}})));
}

TEST(C2KLogGenerator, TheEightRequiredCodesStandInThisOrder) {
  const std::vector<LogCode> required{4234, 4483, 4498, 4790, 4508, 4509, 4734, 4943};
  std::vector<LogCode> codes;
  for (const C2KRecord& each : c2kRecords()) codes.push_back(each.logCode);
  std::erase_if(codes, [&](LogCode code) { return std::ranges::count(required, code) == 0; });
  EXPECT_EQ(codes, required);
}

TEST(C2KLogGenerator, TheRequiredNamesAreFilled) {
  EXPECT_THAT(test::c2kLookupNames(), testing::IsSupersetOf(test::requiredC2KNames));
}

TEST(C2KLogGenerator, TheFirstRequestAlreadyReturnsTheDisplay) {
  C2KFixture fixture({"kChannel"});
  EXPECT_EQ(fixture.generator.generateLogUsingState(fixture.state),
            PlistValue(PlistDictionary::make({{"kChannel", ""}})));
}

TEST(C2KLogGenerator, AMessageOf12BytesDoesNothingAtAll) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.surroundings.log.clear();
  fixture.take(hex("02 0000 B612 00000000000000"));
  EXPECT_THAT(fixture.errors(), IsEmpty());
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), Bytes{});
}

TEST(C2KLogGenerator, ARecordOf13BytesWithAnUnknownCodeDoesNothingAtAll) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(record(0x12B7, ""));
  EXPECT_THAT(fixture.errors(), IsEmpty());
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), Bytes{});
}

TEST(C2KLogGenerator, APrefixedRecordIsDecodedAndKeptWithoutThePrefix) {
  C2KFixture fixture({"kActiveSetPilots"});
  Bytes message = hex("81 77");
  const Bytes inner = emptyActiveSet();
  message.insert(message.end(), inner.begin(), inner.end());
  fixture.take(message);
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "(none)");
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), inner);
}

TEST(C2KLogGenerator, AMessageOf13BytesWithAPrefixIsARecordOf11) {
  C2KFixture fixture({});
  const Bytes inner = hex("01 0000 B612 000000000000");
  fixture.take(hex("81 00 01 0000 B612 000000000000"));
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x12b6 is 11 bytes long but must be at least 25 bytes."));
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), inner);
}

TEST(C2KLogGenerator, EachTickTakesTheRecordsSinceTheLast) {
  C2KFixture fixture({});
  fixture.take(emptyActiveSet());
  fixture.take(record(0x12B6, "", 24));
  Bytes both = emptyActiveSet();
  const Bytes second = record(0x12B6, "", 24);
  both.insert(both.end(), second.begin(), second.end());
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), both);
}

TEST(C2KLogGenerator, ADisplayThatTheStateHoldsIsKept) {
  C2KFixture fixture({"kActiveSetPilots"});
  const PlistValue display = PlistDictionary::make({{"kActiveSetPilots", "as it was"}});
  fixture.state.set("Display", display);
  fixture.take(emptyActiveSet());
  EXPECT_EQ(fixture.generator.generateLogUsingState(fixture.state), display);
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "as it was");
  EXPECT_EQ(fixture.state.find("Template"), nullptr);
}

TEST(C2KLogGenerator, TheTemplateIsReadOncePerState) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.generator.generateLogUsingState(fixture.state);
  fixture.surroundings.resources.files.clear();
  fixture.state.remove("Display");
  EXPECT_EQ(fixture.generator.generateLogUsingState(fixture.state),
            PlistValue(PlistDictionary::make({{"kActiveSetPilots", ""}})));
  EXPECT_THAT(fixture.errors(), IsEmpty());
}

TEST(C2KLogGenerator, AWrongLogTypeIsLoggedButNotDropped) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(test::with(emptyActiveSet(), 0, "07"));
  EXPECT_THAT(fixture.errors(), ElementsAre("Invalid log type: 7. Dropping."));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "(none)");
}

TEST(C2KLogGenerator, TheDaemonsExtraRecordsHaveOtherCodes) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(test::with(emptyActiveSet(), 0, "FF"));
  EXPECT_THAT(fixture.errors(), ElementsAre("Invalid log type: ff. Dropping."));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "");
}

TEST(C2KLogGenerator, ARecordIsKeptEvenAfterItsParserRefusedIt) {
  C2KFixture fixture({});
  fixture.take(record(0x12B6, "", 24));
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), record(0x12B6, "", 24));
}

TEST(C2KLogGenerator, TwoTicksWithoutRecordsGiveAnEmptyIntervalTheSecondTime) {
  C2KFixture fixture({});
  fixture.take(emptyActiveSet());
  fixture.generator.generateLogUsingState(fixture.state);
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), Bytes{});
  EXPECT_EQ(fixture.state.find("History")->array()->size(), 2u);
}

TEST(C2KLogGenerator, ANameUsedTwiceIsFilledInBothPlaces) {
  C2KFixture fixture({});
  fixture.useTemplate(
      PlistDictionary::make({{"A", PlistDictionary::make({{"First", "kActiveSetPilots"}})},
                             {"B", PlistDictionary::make({{"Second", "kActiveSetPilots"}})}}));
  fixture.take(emptyActiveSet());
  EXPECT_EQ(fixture.display(), "A=First=(none)\n\nB=Second=(none)\n\n");
}

TEST(C2KLogGenerator, TheTemplateGivesEmptyLeavesKeepsSortMarksAndSkipsTheRest) {
  C2KFixture fixture({});
  fixture.useTemplate(PlistDictionary::make({{"_sorted", "_sorted"},
                                             {"Number", 7},
                                             {"List", PlistArray::make({"kChannel"})},
                                             {"Section", PlistDictionary::make({{"Leaf", "kChannel"}})}}));
  fixture.surroundings.log.clear();
  EXPECT_EQ(fixture.generator.generateLogUsingState(fixture.state),
            PlistValue(PlistDictionary::make(
                {{"_sorted", "_sorted"}, {"Section", PlistDictionary::make({{"Leaf", ""}})}})));
  EXPECT_THAT(fixture.warnings(), ElementsAre("Processing the template", "Processing the template"));
}

TEST(C2KLogGenerator, TheLookupTableNamesLeafAndDictionary) {
  C2KFixture fixture({"kChannel"});
  fixture.generator.generateLogUsingState(fixture.state);
  const PlistValue entries = fixture.state.find("Lookup")->dictionary()->get("kChannel");
  ASSERT_EQ(entries.array()->size(), 1u);
  const PlistDictionary& entry = *entries.array()->at(0).dictionary();
  EXPECT_EQ(*entry.get("key").string(), "kChannel");
  EXPECT_EQ(entry.get("dict").dictionary(), fixture.state.find("Display")->dictionary());
}

TEST(C2KLogGenerator, TheLeavesOfOneNameStandInTheOrderOfTheWalk) {
  C2KFixture fixture({});
  fixture.useTemplate(PlistDictionary::make({{"Section", PlistDictionary::make({{"First", "kChannel"}})},
                                             {"Second", "kChannel"},
                                             {"Another", PlistDictionary::make({{"Third", "kChannel"}})}}));
  const PlistValue display = fixture.generator.generateLogUsingState(fixture.state);
  const PlistValue entries = fixture.state.find("Lookup")->dictionary()->get("kChannel");
  std::vector<std::string> keys;
  for (const PlistValue& entry : *entries.array()) keys.push_back(*entry.dictionary()->get("key").string());
  EXPECT_THAT(keys, ElementsAre("First", "Second", "Third"));
  EXPECT_EQ(test::asText(display), "Section=First=\n\nSecond=\nAnother=Third=\n\n");
}

TEST(C2KLogGenerator, ANameThatTheTemplateDoesNotUseIsDropped) {
  C2KFixture fixture({"kChannel"});
  fixture.take(emptyActiveSet());
  EXPECT_EQ(fixture.display(), "kChannel=\n");
}

TEST(C2KLogGenerator, ANewGeneratorFillsTheDisplayThatTheStateHolds) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.generator.generateLogUsingState(fixture.state);
  ASSERT_EQ(fixture.text("kActiveSetPilots"), "");
  C2KLogGenerator next(fixture.surroundings.platform());
  next.updateState(fixture.state, emptyActiveSet());
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "(none)");
  EXPECT_EQ(next.generateLogUsingState(fixture.state).dictionary(),
            fixture.state.find("Display")->dictionary());
}

TEST(C2KLogGenerator, ADisplayOfAnotherTechnologyStaysAsItIs) {
  C2KFixture fixture({"kActiveSetPilots"});
  const PlistValue other = PlistDictionary::make({{"kActiveSetPilots", "not a leaf of the lookup"}});
  fixture.state.set("Display", other);
  fixture.take(emptyActiveSet());
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "not a leaf of the lookup");
  EXPECT_EQ(fixture.state.find("Lookup"), nullptr);
  EXPECT_FALSE(fixture.generator.ownsDisplay(fixture.state));
  EXPECT_THAT(fixture.errors(), IsEmpty());
}

TEST(C2KLogGenerator, ALookupThatLeadsIntoAnotherDisplayIsNotWrittenBy) {
  C2KFixture fixture({"kActiveSetPilots"});
  const PlistValue own = fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_TRUE(fixture.generator.ownsDisplay(fixture.state));
  const PlistValue other = PlistDictionary::make({{"kActiveSetPilots", PlistDictionary::make()}});
  fixture.state.set("Display", other);
  EXPECT_FALSE(fixture.generator.ownsDisplay(fixture.state));
  fixture.take(emptyActiveSet());
  EXPECT_EQ(test::asText(own), "kActiveSetPilots=\n");
  EXPECT_EQ(fixture.state.find("Display")->dictionary(), other.dictionary());
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), emptyActiveSet());
  fixture.state.set("Display", own);
  fixture.take(emptyActiveSet());
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "(none)");
}

TEST(C2KLogGenerator, WithoutATemplateRecordsAreKeptAndNothingIsShown) {
  C2KFixture fixture({});
  fixture.surroundings.resources.files.clear();
  fixture.take(emptyActiveSet());
  EXPECT_TRUE(fixture.generator.generateLogUsingState(fixture.state).isAbsent());
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Cannot load C2K template for display", "Cannot load C2K template for display"));
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), emptyActiveSet());
}

TEST(EachLeaf, StopsAtAnEntryThatIsNotWhole) {
  const auto first = PlistDictionary::make();
  const auto last = PlistDictionary::make();
  const PlistDictionary lookup{
      {"name", PlistArray::make({PlistDictionary::make({{"key", "leaf"}, {"dict", first}}),
                                 PlistDictionary::make({{"key", 7}, {"dict", last}}),
                                 PlistDictionary::make({{"key", "leaf"}, {"dict", last}})})},
      {"no list", "text"}};
  const auto fill = [](PlistDictionary& display, const std::string& key) { display.set(key, "value"); };
  forEachLeaf("name", lookup, fill);
  forEachLeaf("no list", lookup, fill);
  forEachLeaf("no such name", lookup, fill);
  EXPECT_EQ(test::asText(first), "leaf=value\n");
  EXPECT_TRUE(last->empty());
}

}  // namespace
}  // namespace kelvasi
