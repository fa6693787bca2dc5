// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<ReselectionCandidatesMisc>;

TEST(ReselectionCandidatesMisc, ShowsTheServingCellInThisOrder) {
  auto section = Section::rows();
  section.take(record(0xB186, "02 FF 9C18 F701 0000"));
  EXPECT_EQ(section.text(), "Version=2\nServing EARFCN=6300\nServing Cell ID=503\n");
}

TEST(ReselectionCandidatesMisc, ARecordOf20BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0xB186, "02 FF 9C18 F701 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(ReselectionCandidatesMisc, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xB180, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Reselection Candidates"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45440"));
}

}  // namespace
}  // namespace kelvasi
