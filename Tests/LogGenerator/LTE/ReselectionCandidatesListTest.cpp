// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/ReselectionCandidatesList.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/LTE/ReselectionCandidates.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<ReselectionCandidatesList>;

std::string shown(const std::string& countAndEntries) {
  auto section = Section::list();
  section.take(record(0xB186, "01 00 9C18 F701 " + countAndEntries));
  return section.text();
}

TEST(ReselectionCandidatesList, ShowsAnLteCandidate) {
  // Cell identity 503, from bit 7 of the third byte on.
  EXPECT_EQ(shown("0100  0700 0000  9C18 80FB"),
            "[Candidate Priority=7\nCandidate RAT Type=LTE\nE ARFCN=6300\nCell ID=503\n]");
  EXPECT_EQ(shown("0100  FFFF 0000  0000 80FF"),
            "[Candidate Priority=65535\nCandidate RAT Type=LTE\nE ARFCN=0\nCell ID=511\n]");
  EXPECT_EQ(shown("0100  FFFF 0000  FFFF 7F00"),
            "[Candidate Priority=65535\nCandidate RAT Type=LTE\nE ARFCN=65535\nCell ID=0\n]");
}

TEST(ReselectionCandidatesList, ShowsAUtranCandidate) {
  EXPECT_EQ(shown("0100  0300 0100  6429 FF01"),
            "[Candidate Priority=3\nCandidate RAT Type=UTRAN\nU ARFCN=10596\nPSC=511\n]");
}

TEST(ReselectionCandidatesList, ShowsAGeranCandidate) {
  EXPECT_EQ(shown("0100  0100 0200  3E00 02 FF"),
            "[Candidate Priority=1\nCandidate RAT Type=GERAN\nARFCN=62\nBand=2\nBSIC ID=255\n]");
}

TEST(ReselectionCandidatesList, ShowsCdmaCandidates) {
  EXPECT_EQ(shown("0100  0200 0300  01 FFFFFF 1901 6C00"),
            "[Candidate Priority=2\nCandidate RAT Type=CDMA1XRTT\nBand=1\nChannel=281\nPilot=108\n]");
  EXPECT_EQ(shown("0100  0200 0400  FF FFFFFF FFFF FFFF"),
            "[Candidate Priority=2\nCandidate RAT Type=CDMAHRPD\nBand=255\nChannel=65535\nPilot=65535\n]");
}

TEST(ReselectionCandidatesList, ARatTypePastTheTableHasNoRowsOfItsOwn) {
  for (const char* type : {"0500", "0700", "FFFF", "0001"}) {
    EXPECT_EQ(shown("0100  0200 " + std::string(type) + "  FFFF FFFF"),
              "[Candidate Priority=2\nCandidate RAT Type=??\n]");
  }
}

TEST(ReselectionCandidatesList, ACandidatesOwnBytesAreTheHeadOfTheNext) {
  EXPECT_EQ(shown("0200  0500 0300  0100 0200  3E00 0304"),
            "[Candidate Priority=5\nCandidate RAT Type=CDMA1XRTT\nBand=1\nChannel=62\nPilot=1027\n]"
            "[Candidate Priority=1\nCandidate RAT Type=GERAN\nARFCN=62\nBand=3\nBSIC ID=4\n]");
}

TEST(ReselectionCandidatesList, OnlyTheLowEightBitsCount) {
  EXPECT_EQ(shown("0001  0200 0700"), "");
  EXPECT_EQ(shown("0101  0200 0700"), "[Candidate Priority=2\nCandidate RAT Type=??\n]");
}

TEST(ReselectionCandidatesList, AnIndexIsBoundedByAll16Bits) {
  const auto& list = lte::reselectionCandidates::candidates;
  const Bytes bytes = record(0xB186, "01 00 0000 0000 0101", 2000);
  EXPECT_EQ(countOf(RecordView(bytes), list), 1u);
  EXPECT_EQ(entryOf(RecordView(bytes), list, 256).size(), bytes.size() - 21 - 4 * 256);
  EXPECT_THROW(entryOf(RecordView(bytes), list, 257), ArrayOutOfBoundsException);
}

TEST(ReselectionCandidatesList, AnEmptyRecordEmptiesTheListAShortOneDoesNot) {
  auto section = Section::list();
  section.take(record(0xB186, "01 00 0000 0000 0100  0200 0700"));
  section.take(record(0xB186, "01 00 0000 0000 00"));
  EXPECT_EQ(section.text(), "[Candidate Priority=2\nCandidate RAT Type=??\n]");
  section.take(record(0xB186, "01 00 0000 0000 0000"));
  EXPECT_EQ(section.text(), "");
}

TEST(ReselectionCandidatesList, TrustsTheCountPastTheEndOfTheRecord) {
  auto section = Section::list();
  section.take(record(0xB186, "01 00 0000 0000 FF00  0200"));
  EXPECT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)),
            "Candidate Priority=0\nCandidate RAT Type=LTE\nE ARFCN=0\nCell ID=0\n");
}

TEST(ReselectionCandidatesList, RowsOfAnEarlierRecordDoNotStay) {
  auto section = Section::list();
  section.take(record(0xB186, "01 00 0000 0000 0100  0100 0200  3E00 0304"));
  section.take(record(0xB186, "01 00 0000 0000 0100  0100 0000  3E00 0000"));
  EXPECT_EQ(section.text(), "[Candidate Priority=1\nCandidate RAT Type=LTE\nE ARFCN=62\nCell ID=0\n]");
}

TEST(ReselectionCandidatesList, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xB180, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Reselection Candidates List"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45440"));
}

}  // namespace
}  // namespace kelvasi
