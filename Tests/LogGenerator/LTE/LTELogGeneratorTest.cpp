// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTELogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Telvon/Technology.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

TEST(LTEClassIndex, SaysOnTheStandardOutputThatItGoes) {
  test::TestPlatform surroundings;
  { LTEClassIndex index(surroundings.platform()); }
  EXPECT_THAT(surroundings.trace.lines, ElementsAre("Deallocing LTEClassIndex", "Deallocing ClassIndex"));
}

TEST(LTELogGenerator, IsWhatTheTechnologyNames) {
  test::TestPlatform surroundings;
  const auto generator =
      LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_Orvane_LTE, surroundings.platform());
  EXPECT_TRUE(dynamic_cast<LTELogGenerator*>(generator.get()));
}

TEST(LTELogGenerator, AnnouncesItselfBeforeEverythingElse) {
  test::TestPlatform surroundings;
  {
    LTELogGenerator generator(surroundings.platform());
    EXPECT_THAT(surroundings.log.errors(),
                ElementsAre("Creating LTELogGenerator object",
                            "Creating OrvaneLogGenerator2 object with <ptr>", "Class Index: 1"));
    EXPECT_EQ(surroundings.log.firstLine(), "Creating LTELogGenerator object");
    surroundings.log.clear();
  }
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("LTELogGenerator is destructed <ptr>",
                                                       "Orvane_GSMLogGenerator is destructed <ptr>"));
}

TEST(LTELogGenerator, ShowsOneRecordInEverySectionThatTakesIt) {
  test::TestPlatform surroundings;
  surroundings.resources.files["LTE.plist"] = surroundings.plists.standFor(PlistDictionary::make(
      {{"Detected Cells", PlistArray::make()},
       {"Group", PlistDictionary::make(
                     {{"Measured Neighbor Cells", PlistArray::make()},
                      {"Connected mode LTE Intra-frequency Measurement", PlistDictionary::make()}})}}));
  LTELogGenerator generator(surroundings.platform());
  PlistDictionary state;
  generator.updateState(state,
                        record(0xB179, "00000000 0100 0200 0300 0000 0000 01 01  0400 0000 0000  0500"));
  EXPECT_EQ(test::asText(generator.generateLogUsingState(state)),
            "Detected Cells=[Physical Cell ID=5\n]\n"
            "Group=Measured Neighbor Cells=[Physical Cell ID=4\n"
            "Filtered RSRP=-140.00 dBm\n"
            "Filtered RSRQ=-20.00 dB\n"
            "]\n"
            "Connected mode LTE Intra-frequency Measurement=E-ARFCN=1\n"
            "Serving Physical Cell ID=2\n"
            "Subframe Number=3\n"
            "Serving Filtered RSRP=-140.00 dBm\n"
            "Serving Filtered RSRQ=-20.00 dB\n"
            "\n\n");
}

TEST(LTELogGenerator, WithoutItsTemplateItDecodesNowhere) {
  test::TestPlatform surroundings;
  LTELogGenerator generator(surroundings.platform());
  surroundings.log.clear();
  PlistDictionary state;
  generator.updateState(state, record(0xB0C1, "", 22));
  EXPECT_TRUE(generator.generateLogUsingState(state).isAbsent());
  EXPECT_THAT(surroundings.log.errors(),
              ElementsAre("Cannot load template for display", "Received an unknown log message: 45249",
                          "Cannot load template for display"));
}

}  // namespace
}  // namespace kelvasi
