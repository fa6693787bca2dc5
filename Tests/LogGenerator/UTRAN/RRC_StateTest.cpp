// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/RRC_State.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<RRC_State>;

TEST(RRC_State, ShowsEachModeAndUnknownPastTheTable) {
  const std::vector<std::pair<const char*, const char*>> modes{
      {"00", "Disconnected"}, {"01", "Connecting"},   {"02", "Cell Fach"},        {"03", "Cell DCH"},
      {"04", "Cell PCH"},     {"05", "Cell URA PCH"}, {"06", "Unknown RRC Mode"}, {"FF", "Unknown RRC Mode"}};
  for (const auto& [mode, text] : modes) {
    auto section = Section::rows();
    section.take(record(0xD0E0, std::string("01 ") + mode));
    EXPECT_EQ(section.text(), std::string("State=") + text + "\n");
  }
}

TEST(RRC_State, UnderstandsLayoutVersionOneOnly) {
  for (const char* version : {"00", "02", "FF"}) {
    auto section = Section::rows();
    section.take(record(0xD0E0, std::string(version) + " 03"));
    EXPECT_EQ(section.text(), "State=Unknown RRC Mode\n");
  }
}

TEST(RRC_State, ARecordOf14BytesIsReportedAndDecodedAllTheSame) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xD0E0, "01"));
  EXPECT_EQ(section.text(), "State=Disconnected\n");
  EXPECT_THAT(section.surroundings.log.warnings(),
              ElementsAre("RRC Info", "LogCode_0xD0E0 is length is 14 expected size 15",
                          "Display Dict = {\n    State = Disconnected;\n}, rrc mode = 0 Disconnected"));
}

TEST(RRC_State, EvenARecordOf11BytesIsDecoded) {
  auto section = Section::rows();
  Bytes bytes = record(0xD0E0, "");
  bytes.resize(11);
  section.take(bytes);
  EXPECT_EQ(section.text(), "State=Unknown RRC Mode\n");
}

TEST(RRC_State, TracesItsSectionAndWhatItShows) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xD0E0, "02 03"));
  EXPECT_THAT(
      section.surroundings.log.warnings(),
      ElementsAre("RRC Info",
                  "Display Dict = {\n    State = \"Unknown RRC Mode\";\n}, rrc mode = 255 Unknown RRC Mode"));
}

TEST(RRC_State, OnlyTracesACodeItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xD0E2, "01 03", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("RRC Info"));
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(RRC_State, WithoutASectionOnlyTraces) {
  test::TestPlatform surroundings;
  RRC_State decoder(surroundings.platform());
  const Bytes bytes = record(0xD0E0, "01 03");
  decoder.updateWithData(RecordView(bytes), 0xD0E0);
  EXPECT_THAT(surroundings.log.warnings(),
              ElementsAre("RRC Info", "Display Dict = (null), rrc mode = 3 Cell DCH"));
}

}  // namespace
}  // namespace kelvasi
