// SPDX-License-Identifier: Apache-2.0
#include "Capture/DlfRecords.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <random>

#include "Capture/HeldBytes.h"
#include "LogGenerator/RecordView.h"
#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {

bool operator==(const DlfRecordPlace& left, const DlfRecordPlace& right) {
  return left.begin == right.begin && left.record == right.record && left.end == right.end;
}
void PrintTo(const DlfRecordPlace& place, std::ostream* stream) {
  *stream << "{" << place.begin << ", " << place.record << ", " << place.end << "}";
}

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

// Hands out no more than so many bytes at once.
class SlowBytes : public ByteSource {
 public:
  SlowBytes(Bytes bytes, std::size_t atOnce) : bytes_(std::move(bytes)), atOnce_(atOnce) {}
  std::ptrdiff_t read(std::span<std::uint8_t> block) override {
    return bytes_.read(block.first(std::min(block.size(), atOnce_)));
  }

 private:
  HeldBytes bytes_;
  std::size_t atOnce_;
};

std::vector<DlfRecordPlace> placesIn(DlfRecordFinder finder) {
  std::vector<DlfRecordPlace> places;
  while (finder.findMore()) {
    while (!finder.found().empty()) places.push_back(finder.take());
  }
  return places;
}

std::vector<DlfRecordPlace> placesIn(Bytes file) {
  HeldBytes bytes(std::move(file));
  return placesIn(DlfRecordFinder(bytes));
}

// A plain record of this size, its payload all 0xCC.
Bytes plain(std::size_t size) {
  Bytes bytes(size, 0xCC);
  bytes[0] = static_cast<std::uint8_t>(size);
  bytes[1] = static_cast<std::uint8_t>(size >> 8);
  bytes[2] = 0x31;
  bytes[3] = 0x71;
  std::fill_n(bytes.begin() + 4, 8, std::uint8_t{0});
  return bytes;
}

TEST(DlfRecords, StandOneAfterAnotherInAPlainFile) {
  EXPECT_THAT(placesIn(plain(12) + plain(20) + plain(13)),
              ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 12, 32}, DlfRecordPlace{32, 32, 45}));
}

TEST(DlfRecords, CarryTheirLogTypeAfterTheFirstOfAnInterval) {
  EXPECT_THAT(placesIn(plain(14) + hex("01") + plain(14) + hex("FF") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 0, 14}, DlfRecordPlace{14, 15, 29}, DlfRecordPlace{29, 30, 42}));
}

TEST(DlfRecords, GoOnWithoutATypeWhereTheNextIntervalBegins) {
  EXPECT_THAT(placesIn(plain(12) + hex("01") + plain(12) + plain(12) + hex("01") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 13, 25}, DlfRecordPlace{25, 25, 37},
                          DlfRecordPlace{37, 38, 50}));
}

TEST(DlfRecords, MayHaveAPrefixAndLoseItsFirstByte) {
  EXPECT_THAT(placesIn(hex("07 01") + plain(12) + hex("81 07 FF") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 2, 14}, DlfRecordPlace{14, 17, 29}));
}

TEST(DlfRecords, MayBeOf257Or255BytesWithoutAType) {
  for (const std::size_t size : {255u, 257u, 511u, 513u}) {
    EXPECT_THAT(placesIn(plain(12) + plain(size) + plain(12)),
                ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 12, 12 + size},
                            DlfRecordPlace{12 + size, 12 + size, 24 + size}))
        << size;
  }
}

// 01 0E read as a length is 0x0E01 = 3585, and 3585 = 239 * 15: from one log type to another.
TEST(DlfRecords, OutnumberTheLongRecordThatALogTypeCouldBegin) {
  Bytes file = plain(14);
  for (int count = 0; count < 300; ++count) file = file + hex("01") + plain(14);
  EXPECT_EQ(placesIn(file).size(), 301u);
}

TEST(DlfRecords, EndBeforeOneThatIsCut) {
  const Bytes cut = plain(12) + hex("01") + plain(20);
  EXPECT_THAT(placesIn(Bytes(cut.begin(), cut.begin() + 32)), ElementsAre(DlfRecordPlace{0, 0, 12}));
}

TEST(DlfRecords, AreNotFoundInWhatIsTooShortToHoldOne) {
  EXPECT_THAT(placesIn({}), IsEmpty());
  EXPECT_THAT(placesIn(hex("0B00 3171 00000000 00000000")), IsEmpty());
  EXPECT_THAT(placesIn(hex("0C00 3171 00000000 000000")), IsEmpty());
}

// Records of an interval with log types, of another without prefixes and so on, as a random number has it.
Bytes mixture(std::uint32_t seed, std::size_t count) {
  std::mt19937 random(seed);
  Bytes file;
  while (count-- > 0) {
    const Bytes leads[]{{}, {}, hex("01"), hex("01"), hex("FF"), hex("810701"), hex("0701")};
    file = file + leads[random() % std::size(leads)] + plain(12 + random() % 40 * (random() % 20));
  }
  return file;
}

// By the definition, without looking at any two places at once: how many records at most lead to each place.
std::size_t mostRecordsIn(const Bytes& file) {
  std::map<std::size_t, std::size_t> most{{0, 0}};
  std::size_t best = 0;
  for (; !most.empty(); most.erase(most.begin())) {
    const auto [place, records] = *most.begin();
    best = std::max(best, records);
    const RecordView at = RecordView(file).from(place);
    const auto isType = [&](std::size_t offset) {
      return at.byteAt(offset) == 1 || at.byteAt(offset) == 0xFF;
    };
    for (const std::size_t lead : {0u, 1u, 2u, 3u}) {
      const bool fits = lead == 0 || (isType(lead - 1) && (lead < 3 || at.byteAt(0) == 0x81));
      const std::size_t length = at.u16(lead);
      if (!fits || length < 12 || place + lead + length > file.size()) continue;
      std::size_t& further = most[place + lead + length];
      further = std::max(further, records + 1);
    }
  }
  return best;
}

TEST(DlfRecords, AreTheMostThatTheFileCanBeReadAs) {
  for (std::uint32_t seed = 0; seed < 50; ++seed) {
    const Bytes file = mixture(seed, 100);
    EXPECT_EQ(placesIn(file).size(), mostRecordsIn(file)) << seed;
  }
}

TEST(DlfRecords, AreTheSameHoweverTheFileComesIn) {
  for (std::uint32_t seed = 0; seed < 10; ++seed) {
    const Bytes file = mixture(seed, 3000);
    const auto places = placesIn(file);
    for (const std::size_t blockSize : {1000u, 65'537u, 1'000'000u}) {
      SlowBytes slow(file, 777);
      EXPECT_EQ(placesIn(DlfRecordFinder(slow, blockSize)), places) << seed;
    }
  }
}

// What is settled is not kept.
TEST(DlfRecords, OfALongFileAreFoundInLittleMemory) {
  Bytes file;
  const Bytes piece = mixture(1, 2000);
  while (file.size() < 20'000'000) file.insert(file.end(), piece.begin(), piece.end());
  const std::size_t size = file.size();
  HeldBytes bytes(std::move(file));
  DlfRecordFinder finder(bytes);
  std::size_t held = 0;
  while (finder.findMore()) {
    while (!finder.found().empty()) finder.take();
    held = std::max(held, finder.held());
  }
  EXPECT_EQ(finder.end(), size);
  EXPECT_LT(held, 4'000'000u);
}

TEST(DlfRecords, StayBoundedInAFileThatCanBeReadAtEveryByte) {
  HeldBytes bytes(Bytes(3'000'000, 0x01));
  DlfRecordFinder finder(bytes);
  std::size_t held = 0;
  while (finder.findMore()) {
    while (!finder.found().empty()) finder.take();
    held = std::max(held, finder.held());
  }
  EXPECT_GT(finder.end(), 2'900'000u);
  EXPECT_LT(held, 2'000'000u);
}

}  // namespace
}  // namespace kelvasi
