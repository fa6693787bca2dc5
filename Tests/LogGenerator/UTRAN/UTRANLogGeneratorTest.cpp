// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Telvon/Technology.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

PlistValue channelsTemplate() {
  return PlistDictionary::make({{"CCTRCH SIR", PlistArray::make()}, {"TRCH BLER", PlistArray::make()}});
}

std::unique_ptr<LogGenerator> generatorFor(test::TestPlatform& surroundings) {
  return LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_Orvane_UTRAN2,
                                               surroundings.platform());
}

TEST(UTRANClassIndex, GoesWithTheLineOfEveryIndexOnly) {
  test::TestPlatform surroundings;
  { UTRANClassIndex index(surroundings.platform()); }
  EXPECT_THAT(surroundings.trace.lines, ElementsAre("Deallocing ClassIndex"));
}

TEST(UTRANLogGenerator, TakesTheFirstTemplateWithItsNameInAnyCase) {
  test::TestPlatform surroundings;
  for (const char* file : {"A.plist", "B utran x.plist", "C UTRAN.plist", "AAUTRAN.txt"})
    surroundings.resources.files[file] = {};
  EXPECT_EQ(UTRANLogGenerator::templateName(surroundings.resources), "B utran x");
}

TEST(UTRANLogGenerator, TheDirectoryOfATemplateCountsAsItsName) {
  struct Elsewhere : test::FakeResources {
    std::vector<std::string> pathsOfType(std::string_view) const override {
      return {"UtRaN/first.one.plist", "UTRAN.plist"};
    }
  };
  EXPECT_EQ(UTRANLogGenerator::templateName(Elsewhere()), "first.one");
}

TEST(UTRANLogGenerator, SaysAfterItsBaseThatItIsThere) {
  test::TestPlatform surroundings;
  surroundings.resources.files["UTRAN.plist"] = surroundings.plists.standFor(channelsTemplate());
  auto generator = generatorFor(surroundings);
  EXPECT_THAT(surroundings.log.errors(), ElementsAre("Creating OrvaneLogGenerator2 object with <ptr>",
                                                     "Class Index: 1", "Created UTRANLogGenerator object"));
  surroundings.log.clear();
  generator.reset();
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("Orvane_GSMLogGenerator is destructed <ptr>"));
}

TEST(UTRANLogGenerator, OneRecordUpdatesBothChannelSections) {
  test::TestPlatform surroundings;
  surroundings.resources.files["UTRAN.plist"] = surroundings.plists.standFor(channelsTemplate());
  auto generator = generatorFor(surroundings);
  PlistDictionary state;
  generator->updateState(state, record(0xD00C, "00 4010 00  05 06", 400));
  EXPECT_EQ(test::asText(generator->generateLogUsingState(state)),
            "CCTRCH SIR=[CCTRCH ID=0\nTSNUM=0\nSIR=[0][0][0][0][0][0]\n]\n"
            "TRCH BLER=[TRCH ID=5\nTRCH BLER Measurement=6\n]\n");
}

struct WithoutTemplate : testing::Test {
  test::TestPlatform surroundings;
  std::unique_ptr<LogGenerator> generator = generatorFor(surroundings);
  PlistDictionary state;
};
using UTRANLogGeneratorWithoutTemplate = WithoutTemplate;

TEST_F(UTRANLogGeneratorWithoutTemplate, IsThereWithoutAWord) {
  EXPECT_TRUE(dynamic_cast<UTRANLogGenerator*>(generator.get()));
  EXPECT_EQ(surroundings.log.firstLine(), "");
}

TEST_F(UTRANLogGeneratorWithoutTemplate, ShowsNothingAndSaysSoEachTime) {
  surroundings.resources.files["LTE.plist"] = surroundings.plists.standFor(channelsTemplate());
  generator = generatorFor(surroundings);
  generator->updateState(state, record(0xD00C, "00 4010 00  05 06", 400));
  EXPECT_TRUE(generator->generateLogUsingState(state).isAbsent());
  EXPECT_THAT(surroundings.log.errors(),
              ElementsAre("Cannot load template for display", "Cannot load template for display"));
}

TEST_F(UTRANLogGeneratorWithoutTemplate, AsksForNoRecords) {
  EXPECT_EQ(generator->getStartCommand(),
            PlistValue(PlistDictionary::make({{"SetState", "Streaming"},
                                              {"SetOrvaneLogCodes", PlistArray::make()},
                                              {"SetTelvonExtraCodes", PlistArray::make()}})));
}

TEST_F(UTRANLogGeneratorWithoutTemplate, StillReportsInvalidTypes) {
  generator->updateState(state, test::hex("02 0000 0CD0 0000000000000000"));
  EXPECT_THAT(surroundings.log.errors(),
              ElementsAre("Cannot load template for display", "Invalid log type: 2. Dropping."));
}

}  // namespace
}  // namespace kelvasi
