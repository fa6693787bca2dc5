// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/OrvaneLogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;

PlistValue entryOf(PlistValue displayState) {
  return PlistDictionary::make({{"DisplayState", std::move(displayState)}});
}

struct Saved {
  explicit Saved(PlistValue::Array history) { state.set("History", std::move(history)); }

  test::TestPlatform surroundings;
  OrvaneLogGenerator generator{surroundings.platform()};
  PlistDictionary state;
};

TEST(OrvaneLogGenerator, WithoutHistoryTheDlfIsTheVersionReport) {
  test::TestPlatform surroundings;
  const OrvaneLogGenerator generator(surroundings.platform());
  const PlistDictionary state;
  EXPECT_EQ(generator.generateDlfFromState(state).data()->size(), 161u);
  const PlistValue contents = generator.getSaveContentsFromState(state);
  ASSERT_EQ(contents.array()->size(), 1u);
  const PlistDictionary& dlf = *contents.array()->at(0).dictionary();
  EXPECT_EQ(*dlf.get("Description").string(), "DLF binary (161 bytes)");
  EXPECT_EQ(dlf.get("DLF").data()->size(), 161u);
}

TEST(OrvaneLogGenerator, IntervalsOfFewerThanTwoBytesContributeNothing) {
  Saved saved(PlistArray::make({entryOf(Bytes{}), entryOf(Bytes{1}), PlistDictionary::make()}));
  EXPECT_EQ(saved.generator.generateDlfFromState(saved.state).data()->size(), 161u);
}

TEST(OrvaneLogGenerator, EachIntervalLosesItsFirstByteOnly) {
  Saved saved(PlistArray::make({entryOf(Bytes{1, 0xAA, 1, 0xBB}), entryOf(Bytes{1, 0xCC})}));
  const PlistValue dlf = saved.generator.generateDlfFromState(saved.state);
  EXPECT_EQ(Bytes(dlf.data()->begin() + 161, dlf.data()->end()), (Bytes{0xAA, 1, 0xBB, 0xCC}));
}

TEST(OrvaneLogGenerator, FiveIntervalsOfAThousandBytesMake5156) {
  const auto history = PlistArray::make();
  for (int number = 0; number < 5; ++number) history->append(entryOf(Bytes(1000)));
  Saved saved(history);
  EXPECT_EQ(saved.generator.generateDlfFromState(saved.state).data()->size(), 5156u);
}

TEST(OrvaneLogGenerator, AnEntryThatIsNoRawDataAbandonsTheDlfAndSavesTheHistoryAlone) {
  Saved saved(PlistArray::make({entryOf(Bytes(10)), entryOf("text")}));
  EXPECT_TRUE(saved.generator.generateDlfFromState(saved.state).isAbsent());
  EXPECT_THAT(saved.surroundings.log.lines(LogPriority::dlf),
              ElementsAre("Got wrong class writing history to DLF; aborting writing the DLF file"));
  EXPECT_EQ(saved.generator.getSaveContentsFromState(saved.state).array()->size(), 2u);
}

TEST(OrvaneLogGenerator, SaveContentsAreACopyOfTheHistory) {
  const auto history = PlistArray::make({entryOf(Bytes(10))});
  Saved saved(history);
  const PlistValue contents = saved.generator.getSaveContentsFromState(saved.state);
  history->removeAll();
  ASSERT_EQ(contents.array()->size(), 2u);
  EXPECT_EQ(contents.array()->at(0), entryOf(Bytes(10)));
}

}  // namespace
}  // namespace kelvasi
