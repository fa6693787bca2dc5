// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<UTRANNeighbhorMeasurements>;

// Byte 16, and the cells from byte 168 on.
Bytes neighbours(std::string_view countByte, std::string_view cells) {
  Bytes bytes = record(0xD00A, "FFFFFF" + std::string(countByte), 168);
  const Bytes tail = test::hex(cells);
  bytes.insert(bytes.end(), tail.begin(), tail.end());
  return bytes;
}

std::string shown(const Bytes& bytes) {
  auto section = Section::list();
  section.take(bytes);
  return section.text();
}

TEST(UTRANNeighbhorMeasurements, ShowsACellInThisOrder) {
  EXPECT_EQ(shown(neighbours("02", "2A4523A2 FFFFFFFFFFFFFFFFFFFFFFFF")),
            "[UARFCN=1322\nCell ID=13\nFilter RSCP=0.066406\nStatus=MSET\ninJDCS=TRUE\n]");
}

TEST(UTRANNeighbhorMeasurements, ACellInNoSetHasNoStatus) {
  EXPECT_EQ(shown(neighbours("02", "00000060")),
            "[UARFCN=0\nCell ID=0\nFilter RSCP=0.000000\ninJDCS=FALSE\n]");
}

TEST(UTRANNeighbhorMeasurements, ShowsEachSet) {
  EXPECT_EQ(shown(neighbours("02", "00000000")),
            "[UARFCN=0\nCell ID=0\nFilter RSCP=0.000000\nStatus=ASET\ninJDCS=FALSE\n]");
  EXPECT_EQ(shown(neighbours("02", "00000040")),
            "[UARFCN=0\nCell ID=0\nFilter RSCP=0.000000\nStatus=DSET\ninJDCS=FALSE\n]");
}

TEST(UTRANNeighbhorMeasurements, EachFieldKeepsToItsBits) {
  EXPECT_EQ(shown(neighbours("02", "FF3F0000")),
            "[UARFCN=16383\nCell ID=0\nFilter RSCP=0.000000\nStatus=ASET\ninJDCS=FALSE\n]");
  EXPECT_EQ(shown(neighbours("02", "00C01F00")),
            "[UARFCN=0\nCell ID=127\nFilter RSCP=0.000000\nStatus=ASET\ninJDCS=FALSE\n]");
  EXPECT_EQ(shown(neighbours("02", "0000E01F")),
            "[UARFCN=0\nCell ID=0\nFilter RSCP=0.996094\nStatus=ASET\ninJDCS=FALSE\n]");
}

TEST(UTRANNeighbhorMeasurements, TheLowBitOfByte16DoesNotCount) {
  EXPECT_EQ(shown(neighbours("01", "2A4523A2")), "");
  EXPECT_EQ(shown(neighbours("03", "2A4523A2")), shown(neighbours("02", "2A4523A2")));
}

TEST(UTRANNeighbhorMeasurements, CellsAre16BytesApartFromByte168) {
  EXPECT_EQ(shown(neighbours("04", "01000000 000000000000000000000000 02000060")),
            "[UARFCN=1\nCell ID=0\nFilter RSCP=0.000000\nStatus=ASET\ninJDCS=FALSE\n]"
            "[UARFCN=2\nCell ID=0\nFilter RSCP=0.000000\ninJDCS=FALSE\n]");
}

TEST(UTRANNeighbhorMeasurements, ARecordOf20BytesLeavesTheListAsItIs) {
  auto section = Section::list();
  section.take(neighbours("02", "2A4523A2"));
  const std::string before = section.text();
  section.take(record(0xD00A, "000000 00", 20));
  EXPECT_EQ(section.text(), before);
  section.take(record(0xD00A, "000000 00", 21));
  EXPECT_EQ(section.text(), "");
}

TEST(UTRANNeighbhorMeasurements, TrustsTheCountPastTheEndOfTheRecord) {
  auto section = Section::list();
  section.take(record(0xD00A, "000000 FF", 21));
  EXPECT_EQ(section.section.array()->size(), 127u);
}

TEST(UTRANNeighbhorMeasurements, OnlyTracesACodeItDidNotAskFor) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xD00E, "000000 02", 200));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("NeighbhorMeasurements List"));
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

}  // namespace
}  // namespace kelvasi
