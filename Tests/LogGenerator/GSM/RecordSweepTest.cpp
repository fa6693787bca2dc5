// SPDX-License-Identifier: Apache-2.0
// What the sweeps of every section do not reach by themselves.
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "Tests/LogGenerator/Sections/EverySection.h"

namespace kelvasi {
namespace {

using Sections = test::EverySection<Orvane_GSMClassIndex>;

// Its entries are past the end, so its one code is 0 for ARFCN 0, and the neighbours' ARFCNs are 0 as well.
TEST(GSMRecordSweep, ABsicListOfItsMinimumIsKeptForTheNextMeasurements) {
  for (std::size_t length = 0; length <= 17; ++length) {
    Sections sections;
    sections.bind(0x5137);
    sections.take(0x51FF, length, 0xFF);
    sections.take(0x5137, 29, 0xFF);
    EXPECT_EQ(sections.shown().find("BSIC=0\n") != std::string::npos, length >= 15) << length;
  }
}

// What is no property list shows nothing; lists let go of the cells of before.
TEST(GSMRecordSweep, PropertyListRecordsOfEveryLengthAreTaken) {
  for (const LogCode logCode : {0xFF0001U, 0xFF0002U}) {
    Sections sections;
    sections.bind(logCode);
    for (std::size_t length = 0; length <= 15; ++length) sections.take(logCode, length, 0xFF);
    EXPECT_EQ(sections.shown(), "") << logCode;
  }
  Sections sections;
  sections.bind(0xFF0000);
  for (std::size_t length = 0; length <= 15; ++length) {
    EXPECT_THROW(sections.take(0xFF0000, length, 0xFF), LogCode_0xFF000020::UnknownDataException) << length;
  }
}

// 31 cells, all of them of the active set, cut inside every identity and every energy.
TEST(GSMRecordSweep, AnActiveSetIsReadWhereverTheRecordEnds) {
  Sections sections;
  sections.bind(0x417A);
  for (std::size_t length = 13; length <= 16 + 31 * (15 + 44) + 2; length += 7)
    sections.take(0x417A, length, 0x1F);
  EXPECT_NE(sections.shown(), "");
}

}  // namespace
}  // namespace kelvasi
