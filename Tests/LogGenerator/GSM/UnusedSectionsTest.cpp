// SPDX-License-Identifier: Apache-2.0
// The sections that ask for no records.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/GSM/GSMTables.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

// Whether the section is a dictionary or an array, it stays as it is.
template <typename Decoder>
void expectTraceOnly(const char* trace) {
  for (const PlistValue& container :
       {PlistValue(PlistDictionary::make({{"Label", "text"}})), PlistValue(PlistArray::make({"text"}))}) {
    test::SectionFixture<Decoder> section(container);
    const std::string before = section.text();
    EXPECT_TRUE(section.decoder.getLogCodeArray().empty());
    section.surroundings.log.clear();
    section.take(test::record(0x417A, "0000 01", 100));
    EXPECT_EQ(section.text(), before);
    EXPECT_THAT(section.surroundings.log.warnings(), testing::ElementsAre(trace));
    EXPECT_THAT(section.surroundings.log.errors(), testing::IsEmpty());
  }
}

TEST(CellChangeCounters, WritesItsTraceAndNothingElse) {
  expectTraceOnly<CellChangeCounters>("CellChangeCounters");
}

TEST(CodingScheme, WritesTheTraceOfCellChangeCounters) {
  expectTraceOnly<CodingScheme>("CellChangeCounters");
}

TEST(NonRankedGSMSet, WritesItsTraceAndNothingElse) {
  expectTraceOnly<NonRankedGSMSet>("NonRankedGSMSet");
}

TEST(NonRankedUMTSSet, WritesItsTraceAndNothingElse) {
  expectTraceOnly<NonRankedUMTSSet>("NonRankedUMTSSet");
}

TEST(UMTSRRMeasurement, WritesItsTraceAndNothingElse) {
  expectTraceOnly<UMTSRRMeasurement>("UMTSRRMeasurement");
}

}  // namespace
}  // namespace kelvasi
