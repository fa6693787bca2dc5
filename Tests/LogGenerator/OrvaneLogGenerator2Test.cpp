// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/OrvaneLogGenerator2.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using test::hex;
using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::array<LogCode, 2> wantedCodes{0xB0C0, 0xFF0001};

// Notes what it is given: one row per log code, with the record's length.
class Recorder : public Base {
 public:
  using Base::Base;
  std::string_view getSectionName() const override { return "Recorded"; }
  std::span<const LogCode> getLogCodeArray() const override { return wantedCodes; }
  Outcome updateWithData(RecordView view, LogCode logCode) override {
    if (sectionRows()) sectionRows()->setText(std::to_string(logCode), std::to_string(view.size()));
    return rowsOutcome();
  }
};

class RecorderIndex : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;
  ~RecorderIndex() override { deallocWith("Deallocing RecorderIndex"); }
  Recorder& recorder = create<Recorder>();
};

struct Fixture {
  explicit Fixture(PlistValue displayTemplate) {
    if (displayTemplate)
      surroundings.resources.files["T.plist"] = surroundings.plists.standFor(displayTemplate);
  }
  void take(const Bytes& message) { generator.updateState(state, message); }
  PlistValue tick() { return generator.generateLogUsingState(state); }

  test::TestPlatform surroundings;
  OrvaneLogGenerator2 generator{surroundings.platform(), "T",
                                std::make_unique<RecorderIndex>(surroundings.platform())};
  PlistDictionary state;
};

PlistValue simpleTemplate() {
  return PlistDictionary::make({{"Recorded", PlistDictionary::make()}, {"Label", "text"}});
}

PlistValue displayWith(PlistValue rows) {
  return PlistDictionary::make({{"Recorded", std::move(rows)}, {"Label", "text"}});
}

TEST(OrvaneLogGenerator2, OwnsTheDisplayThatItMakes) {
  Fixture fixture(simpleTemplate());
  EXPECT_TRUE(fixture.generator.ownsDisplay(fixture.state));
  fixture.take(record(0xB0C0, "", 20));
  EXPECT_TRUE(fixture.generator.ownsDisplay(fixture.state));
}

TEST(OrvaneLogGenerator2, TheFirstTickWithoutAMessageReturnsNothingTheSecondTheDisplay) {
  Fixture fixture(simpleTemplate());
  EXPECT_TRUE(fixture.tick().isAbsent());
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make()));
}

TEST(OrvaneLogGenerator2, AMessageBeforeTheFirstTickBuildsTheDisplay) {
  Fixture fixture(simpleTemplate());
  fixture.take(record(0xB0C0, "", 20));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make({{"45248", "20"}})));
}

TEST(OrvaneLogGenerator2, DispatchesByEffectiveCodeAndWithoutThePrefix) {
  Fixture fixture(simpleTemplate());
  fixture.take(hex("FF 0000 0100 0000000000000000"));
  fixture.take(hex("01 0000 0100 0000000000000000"));
  fixture.take(hex("8100 01 0000 C0B0 0000000000000000"));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make({{"16711681", "13"}, {"45248", "13"}})));
}

TEST(OrvaneLogGenerator2, APrefixedMessageOf13BytesIsDispatchedAsARecordOf11) {
  Fixture fixture(simpleTemplate());
  fixture.take(hex("8100 01 0000 C0B0 000000000000"));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make({{"45248", "11"}})));
}

TEST(OrvaneLogGenerator2, AMessageOf12BytesIsIgnoredWithoutALine) {
  Fixture fixture(simpleTemplate());
  fixture.surroundings.log.clear();
  fixture.take(hex("01 0000 C0B0 00000000000000"));
  EXPECT_THAT(fixture.surroundings.log.errors(), IsEmpty());
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make()));
}

TEST(OrvaneLogGenerator2, AnInvalidLogTypeIsLoggedAndDropped) {
  Fixture fixture(simpleTemplate());
  fixture.surroundings.log.clear();
  fixture.take(hex("FE 0000 C0B0 0000000000000000"));
  EXPECT_THAT(fixture.surroundings.log.errors(), ElementsAre("Invalid log type: fe. Dropping."));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make()));
}

TEST(OrvaneLogGenerator2, EveryMessageIsKeptAsReceivedForTheInterval) {
  Fixture fixture(simpleTemplate());
  fixture.take(hex("02 AA"));
  fixture.take(hex("8100 01 0000 C0B0 0000000000000000"));
  fixture.tick();
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), hex("02 AA 8100 01 0000 C0B0 0000000000000000"));
}

TEST(OrvaneLogGenerator2, ATickWithoutMessagesStoresAnEmptyBlob) {
  Fixture fixture(simpleTemplate());
  fixture.take(hex("02 AA"));
  fixture.tick();
  fixture.tick();
  EXPECT_EQ(*fixture.state.find("DisplayState")->data(), Bytes{});
}

TEST(OrvaneLogGenerator2, EachTickAddsAHistoryEntry) {
  Fixture fixture(simpleTemplate());
  fixture.take(hex("02 AA"));
  fixture.tick();
  fixture.tick();
  const PlistArray& history = *fixture.state.find("History")->array();
  ASSERT_EQ(history.size(), 2u);
  EXPECT_EQ(*history.at(0).dictionary()->get("DisplayState").data(), hex("02 AA"));
  EXPECT_EQ(history.at(0).dictionary()->size(), 5u);
}

TEST(OrvaneLogGenerator2, StartCommandSplitsTheCodes) {
  const Fixture fixture(simpleTemplate());
  EXPECT_EQ(fixture.generator.getStartCommand(),
            PlistValue(PlistDictionary::make({{"SetState", "Streaming"},
                                              {"SetOrvaneLogCodes", PlistArray::make({45248})},
                                              {"SetTelvonExtraCodes", PlistArray::make({1})}})));
}

TEST(OrvaneLogGenerator2, ASectionWithoutADecoderStaysAsTheTemplateHasIt) {
  const PlistValue rows = PlistDictionary::make({{"Static", "text"}, {"List", PlistArray::make({"a", "b"})}});
  Fixture fixture(PlistDictionary::make({{"Recorded", PlistDictionary::make()}, {"Other", rows}}));
  fixture.take(record(0xB0C0, ""));
  EXPECT_EQ(fixture.tick().dictionary()->get("Other"), rows);
}

TEST(OrvaneLogGenerator2, InitialRowsShowUntilTheDecoderWritesThem) {
  Fixture fixture(PlistDictionary::make({{"Recorded", PlistDictionary::make({{"45248", "none yet"}})}}));
  fixture.tick();
  EXPECT_EQ(*fixture.tick().dictionary()->get("Recorded").dictionary()->get("45248").string(), "none yet");
  fixture.take(record(0xB0C0, ""));
  EXPECT_EQ(*fixture.tick().dictionary()->get("Recorded").dictionary()->get("45248").string(), "13");
}

TEST(OrvaneLogGenerator2, ASectionThatOccursTwiceBindsItsLastOccurrence) {
  Fixture fixture(
      PlistDictionary::make({{"A", PlistDictionary::make({{"Recorded", PlistDictionary::make()}})},
                             {"B", PlistDictionary::make({{"Recorded", PlistDictionary::make()}})}}));
  fixture.take(record(0xB0C0, ""));
  const PlistValue display = fixture.tick();
  EXPECT_TRUE(display.dictionary()->get("A").dictionary()->get("Recorded").dictionary()->empty());
  EXPECT_EQ(display.dictionary()->get("B").dictionary()->get("Recorded").dictionary()->size(), 1u);
}

TEST(OrvaneLogGenerator2, TheTemplateItselfIsNotWrittenTo) {
  Fixture fixture(simpleTemplate());
  fixture.take(record(0xB0C0, ""));
  EXPECT_EQ(*fixture.state.find("Template"), simpleTemplate());
}

TEST(OrvaneLogGenerator2, WithoutATemplateEveryMessageAndTickTriesAgain) {
  Fixture fixture{PlistValue()};
  fixture.surroundings.log.clear();
  fixture.take(record(0xB0C0, ""));
  EXPECT_TRUE(fixture.tick().isAbsent());
  EXPECT_THAT(fixture.surroundings.log.errors(),
              ElementsAre("Cannot load template for display", "Cannot load template for display"));
  EXPECT_EQ(fixture.state.find("Display"), nullptr);
  fixture.surroundings.resources.files["T.plist"] = fixture.surroundings.plists.standFor(simpleTemplate());
  fixture.take(record(0xB0C0, ""));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make({{"45248", "13"}})));
}

TEST(OrvaneLogGenerator2, ATemplateWhoseRootIsNoDictionaryCannotBeLoaded) {
  Fixture fixture(PlistArray::make());
  fixture.surroundings.log.clear();
  fixture.tick();
  EXPECT_THAT(fixture.surroundings.log.errors(), ElementsAre("Cannot load template for display"));
}

TEST(OrvaneLogGenerator2, AValueThatDoesNotBelongIntoATemplateCannotBeStored) {
  Fixture fixture(PlistDictionary::make({{"Number", 7}}));
  fixture.surroundings.log.clear();
  EXPECT_THROW(fixture.tick(), std::invalid_argument);
  EXPECT_THAT(fixture.surroundings.log.errors(), ElementsAre("Received an object of unknown type"));
  EXPECT_EQ(fixture.surroundings.log.warnings().back(), "Processing the template");
}

TEST(OrvaneLogGenerator2, PrintDictComplainsOfEachElementThatDoesNotBelong) {
  Fixture fixture(simpleTemplate());
  fixture.surroundings.log.clear();
  fixture.generator.printDict(
      PlistDictionary::make({{"a", 1}, {"b", PlistArray::make({"text", true})}, {"c", "text"}}));
  EXPECT_THAT(fixture.surroundings.log.errors(),
              ElementsAre("Received an object of unknown type", "Received an object of unknown type"));
}

TEST(OrvaneLogGenerator2, ANewStateBuildsANewDisplayAndBindsTheDecodersToIt) {
  Fixture fixture(simpleTemplate());
  fixture.take(record(0xB0C0, ""));
  PlistDictionary second;
  fixture.generator.updateState(second, record(0xFF0001, ""));
  EXPECT_EQ(fixture.tick(), displayWith(PlistDictionary::make({{"45248", "13"}})));
  EXPECT_EQ(fixture.generator.generateLogUsingState(second),
            displayWith(PlistDictionary::make({{"16711681", "13"}})));
}

// Another generator for a state that has been filled before, as after a reconnection.
struct Successor {
  explicit Successor(Fixture& before) : Successor(before, before.state.get("Template")) {}
  Successor(Fixture& before, PlistValue displayTemplate) : state(before.state) {
    surroundings.log.clear();
    surroundings.resources.files["T.plist"] = surroundings.plists.standFor(std::move(displayTemplate));
  }
  void take(const Bytes& message) { generator.updateState(state, message); }
  PlistValue tick() { return generator.generateLogUsingState(state); }

  test::TestPlatform surroundings;
  OrvaneLogGenerator2 generator{surroundings.platform(), "T",
                                std::make_unique<RecorderIndex>(surroundings.platform())};
  PlistDictionary& state;
};

TEST(OrvaneLogGenerator2, ANewGeneratorFillsTheDisplayThatTheStateHolds) {
  Fixture before(simpleTemplate());
  before.take(record(0xB0C0, "", 20));
  const PlistDictionary* const display = before.tick().dictionary();
  Successor after(before);
  after.take(record(0xB0C0, "", 21));
  EXPECT_EQ(after.tick(), displayWith(PlistDictionary::make({{"45248", "21"}})));
  after.take(record(0xFF0001, "", 22));
  EXPECT_EQ(after.tick(), displayWith(PlistDictionary::make({{"45248", "21"}, {"16711681", "22"}})));
  EXPECT_EQ(after.tick().dictionary(), display);
  EXPECT_THAT(after.surroundings.log.errors(), IsEmpty());
  EXPECT_THAT(after.surroundings.log.warnings(), IsEmpty());
}

TEST(OrvaneLogGenerator2, ANewGeneratorBindsOnATickToo) {
  Fixture before(simpleTemplate());
  before.take(record(0xB0C0, "", 20));
  Successor after(before);
  EXPECT_EQ(after.tick(), displayWith(PlistDictionary::make({{"45248", "20"}})));
  after.take(record(0xB0C0, "", 21));
  EXPECT_EQ(after.tick(), displayWith(PlistDictionary::make({{"45248", "21"}})));
}

TEST(OrvaneLogGenerator2, ANewGeneratorBindsTheSameOccurrenceOfASection) {
  Fixture before(PlistDictionary::make(
      {{"A", PlistDictionary::make({{"Recorded", PlistDictionary::make()}})},
       {"L", PlistArray::make(
                 {PlistDictionary::make({{"Recorded", PlistDictionary::make({{"45248", "none yet"}})}})})}}));
  before.tick();
  Successor after(before);
  after.take(record(0xB0C0, "", 20));
  const PlistValue display = after.tick();
  EXPECT_TRUE(display.dictionary()->get("A").dictionary()->get("Recorded").dictionary()->empty());
  const PlistValue inList = display.dictionary()->get("L").array()->at(0).dictionary()->get("Recorded");
  EXPECT_EQ(inList, PlistValue(PlistDictionary::make({{"45248", "20"}})));
}

TEST(OrvaneLogGenerator2, RowsThatADecoderAddedAreNotTakenForSections) {
  Fixture before(
      PlistDictionary::make({{"Recorded", PlistDictionary::make()}, {"List", PlistArray::make()}}));
  before.tick();
  const PlistValue entry = PlistDictionary::make({{"Recorded", PlistDictionary::make()}});
  before.tick().dictionary()->get("List").array()->append(entry);
  Successor after(before);
  after.take(record(0xB0C0, "", 20));
  EXPECT_EQ(after.tick().dictionary()->get("Recorded"), PlistValue(PlistDictionary::make({{"45248", "20"}})));
  EXPECT_TRUE(entry.dictionary()->get("Recorded").dictionary()->empty());
}

// Of another technology, though it has a section of the same name.
PlistValue otherTemplate() {
  return PlistDictionary::make({{"Recorded", PlistDictionary::make({{"45248", "of before"}})}});
}

TEST(OrvaneLogGenerator2, ADisplayOfAnotherTechnologyStaysAndIsNotWrittenInto) {
  Fixture before(otherTemplate());
  before.tick();
  const PlistValue display = before.tick();
  Successor after(before, simpleTemplate());
  EXPECT_FALSE(after.generator.ownsDisplay(after.state));
  after.take(record(0xB0C0, "", 20));
  EXPECT_EQ(after.tick(), otherTemplate());
  EXPECT_EQ(after.tick().dictionary(), display.dictionary());
  EXPECT_FALSE(after.generator.ownsDisplay(after.state));
  EXPECT_THAT(after.surroundings.log.errors(), IsEmpty());
  EXPECT_THAT(after.surroundings.log.warnings(), IsEmpty());
}

TEST(OrvaneLogGenerator2, HistoryEntriesOfAnotherTechnologyAreNotRewritten) {
  Fixture before(otherTemplate());
  before.tick();
  before.tick();
  Successor after(before, simpleTemplate());
  after.take(record(0xB0C0, "", 20));
  after.tick();
  const PlistArray& history = *after.state.find("History")->array();
  for (std::size_t place = 0; place < history.size(); ++place)
    EXPECT_EQ(history.at(place).dictionary()->get("Display"), otherTemplate()) << place;
}

TEST(OrvaneLogGenerator2, TheFirstTechnologysGeneratorWritesIntoItsDisplayAgain) {
  Fixture before(otherTemplate());
  before.tick();
  Successor other(before, simpleTemplate());
  other.take(record(0xB0C0, "", 20));
  Successor again(before, otherTemplate());
  EXPECT_TRUE(again.generator.ownsDisplay(again.state));
  again.take(record(0xB0C0, "", 21));
  EXPECT_EQ(again.tick().dictionary()->get("Recorded"), PlistValue(PlistDictionary::make({{"45248", "21"}})));
}

TEST(OrvaneLogGenerator2, ADisplayThatAnObjectStreamPutThereIsNotWrittenInto) {
  Fixture before(simpleTemplate());
  before.tick();
  const PlistValue display =
      PlistDictionary::make({{"Network", PlistDictionary::make({{"Cell", "1"}, {"Channel", "2"}})}});
  before.state.set("Display", display);
  Successor after(before);
  after.take(record(0xB0C0, "", 20));
  EXPECT_EQ(after.tick().dictionary(), display.dictionary());
  EXPECT_EQ(after.tick().dictionary()->size(), 1u);
  EXPECT_FALSE(after.generator.ownsDisplay(after.state));
}

TEST(OrvaneLogGenerator2, AGeneratorThatMeetsAnotherTechnologysStateLeavesItsOwnDisplayAlone) {
  Fixture fixture(simpleTemplate());
  fixture.take(record(0xB0C0, "", 20));
  PlistDictionary other{{"Template", otherTemplate()}, {"Display", otherTemplate()}};
  fixture.generator.updateState(other, record(0xB0C0, "", 21));
  EXPECT_EQ(*fixture.state.find("Display"), displayWith(PlistDictionary::make({{"45248", "20"}})));
  fixture.take(record(0xB0C0, "", 22));
  EXPECT_EQ(*fixture.state.find("Display"), displayWith(PlistDictionary::make({{"45248", "22"}})));
}

TEST(OrvaneLogGenerator2, ADisplayWithoutATemplateIsAnothers) {
  Fixture fixture(simpleTemplate());
  const auto rows = PlistDictionary::make();
  fixture.state.set("Display",
                    PlistDictionary::make({{"A", PlistArray::make({"text"})}, {"Recorded", rows}}));
  fixture.take(record(0xB0C0, "", 20));
  EXPECT_TRUE(rows->empty());
  EXPECT_FALSE(fixture.generator.ownsDisplay(fixture.state));
}

TEST(OrvaneLogGenerator2, ADisplayThatIsATextStays) {
  Fixture fixture(simpleTemplate());
  fixture.state.set("Display", "text");
  fixture.take(record(0xB0C0, "", 20));
  EXPECT_EQ(fixture.tick(), PlistValue("text"));
  EXPECT_FALSE(fixture.generator.ownsDisplay(fixture.state));
}

TEST(OrvaneLogGenerator2, BuildingTheDisplayNamesIndexAndGeneratorThenTheIndexsStatus) {
  Fixture fixture(simpleTemplate());
  fixture.surroundings.log.clear();
  fixture.tick();
  EXPECT_THAT(fixture.surroundings.log.warnings(), ElementsAre("Initialized class index: <ptr>, Self: <ptr>",
                                                               "Dictionary = 1", "String = 0", "Recorded"));
  fixture.surroundings.log.clear();
  fixture.tick();
  EXPECT_THAT(fixture.surroundings.log.warnings(), IsEmpty());
}

TEST(OrvaneLogGenerator2, WithoutDecodersItShowsNothingEvenWhereATemplateIsThere) {
  struct Bare : OrvaneLogGenerator2 {
    explicit Bare(const Platform& platform) : OrvaneLogGenerator2(platform) {}
  };
  test::TestPlatform surroundings;
  Bare generator(surroundings.platform());
  PlistDictionary state{{"Template", simpleTemplate()}};
  generator.updateState(state, record(0xB0C0, ""));
  EXPECT_TRUE(generator.generateLogUsingState(state).isAbsent());
  EXPECT_EQ(state.find("Display"), nullptr);
}

}  // namespace
}  // namespace kelvasi
