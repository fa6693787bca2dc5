// SPDX-License-Identifier: Apache-2.0
// Once the rows of a section exist, a record costs no allocation: what the test of every section does not
// reach by itself.
#include <gtest/gtest.h>

#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Tests/Support/AllocationCounter.h"
#include "Tests/Support/CellList.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::cell;
using test::record;

class Sections {
 public:
  Sections() {
    surroundings_.log.isMasked = true;
    for (const auto& key : index_.getAllLogCodes()) {
      for (Base* decoder : index_.getSubscribers(static_cast<LogCode>(std::stoul(key)))) bind(*decoder);
    }
  }

  void take(const Bytes& bytes) {
    const LogCode code =
        static_cast<LogCode>(bytes[3] | (bytes[4] << 8)) | (bytes[0] == 0xFF ? 0xFF0000u : 0u);
    for (Base* decoder : index_.getSubscribers(code)) decoder->updateWithData(RecordView(bytes), code);
  }
  Bytes plistRecord(LogCode logCode, PlistValue value) {
    const Bytes token = surroundings_.plists.standFor(std::move(value));
    return test::textRecord(logCode, std::string(token.begin(), token.end()));
  }
  // A display of text: what the records really reached.
  std::string shown() const {
    std::string text;
    for (const PlistValue& section : containers_) text += test::asText(section);
    return text;
  }

 private:
  void bind(Base& decoder) {
    containers_.push_back(test::sectionFor(decoder));
    decoder.updateSectionRef(containers_.back());
  }

  test::TestPlatform surroundings_;
  Orvane_GSMClassIndex index_{surroundings_.platform()};
  std::vector<PlistValue> containers_;
};

std::size_t allocationsOfAThousand(Sections& sections, const Bytes& first, const Bytes& second) {
  for (int round = 0; round < 2; ++round) {
    sections.take(first);
    sections.take(second);
  }
  return test::allocationsDuring([&] {
    for (int round = 0; round < 500; ++round) {
      sections.take(first);
      sections.take(second);
    }
  });
}

TEST(AllocationCounter, SeesAnAllocation) {
  EXPECT_EQ(test::allocationsDuring([] { const auto text = std::string(100, 'a'); }), 1u);
  EXPECT_EQ(test::allocationsDuring([] {}), 0u);
}

TEST(GSMAllocations, AnActiveSetOfTwoCellsCostsNone) {
  Sections sections;
  const Bytes strong = record(0x417A, "0000 02", 200);
  const Bytes weak = record(0x417A, "0080 02 00000000000000 FF1F", 200);
  EXPECT_EQ(allocationsOfAThousand(sections, strong, weak), 0u);
  EXPECT_NE(sections.shown(), "");
}

TEST(GSMAllocations, BsicsThatComeAndGoCostNone) {
  Sections sections;
  const Bytes measured = record(0x5137, "0000 00 00000000 00000000 0000 00 00 01 0A00 10", 60);
  const Bytes coded = record(0x51FF, "00 01 0A00 3F");
  const Bytes none = record(0x51FF, "00 00");
  const auto round = [&] {
    for (const Bytes* bytes : {&coded, &measured, &none, &measured}) sections.take(*bytes);
  };
  round();
  EXPECT_EQ(test::allocationsDuring([&] {
              for (int times = 0; times < 250; ++times) round();
            }),
            0u);
}

TEST(GSMAllocations, ACellListCostsNoneUntilItChanges) {
  Sections sections;
  const auto full = [](std::string_view technology, std::string_view type) {
    return cell(technology, type,
                {{"MCC", 310},
                 {"MNC", 1},
                 {"LAC", 1},
                 {"CellId", 5},
                 {"ARFCN", 512},
                 {"UARFCN", 10564},
                 {"SCN", 12},
                 {"RSCP", -95},
                 {"ECN0", -7},
                 {"RSSI", -40}});
  };
  const Bytes cells = sections.plistRecord(
      0xFF0001, PlistArray::make({full(test::gsm, test::serving), full(test::umts, test::serving),
                                  full(test::gsm, test::neighbour), full(test::umts, test::neighbour)}));
  EXPECT_EQ(allocationsOfAThousand(sections, cells, cells), 0u);
  EXPECT_NE(sections.shown(), "");
}

TEST(GSMAllocations, SimFilesAndContextsCostNoneUntilTheyChange) {
  Sections sections;
  const Bytes sim = sections.plistRecord(
      0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", "8949001234567890123456"},
                                       {"kSimFile_LOCI", Bytes{1, 2}},
                                       {"kSimFile_FPLMN", PlistArray::make({"310 01"})}}));
  const Bytes contexts =
      sections.plistRecord(0xFF0002, PlistArray::make({PlistDictionary::make({{"APN", "internet"}})}));
  EXPECT_EQ(allocationsOfAThousand(sections, sim, sim), 0u);
  EXPECT_EQ(allocationsOfAThousand(sections, contexts, contexts), 0u);
  EXPECT_NE(sections.shown(), "");
}

}  // namespace
}  // namespace kelvasi
