#include "Capture/DlfRecords.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

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
  EXPECT_THAT(findDlfRecords(plain(12) + plain(20) + plain(13)),
              ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 12, 32}, DlfRecordPlace{32, 32, 45}));
}

TEST(DlfRecords, CarryTheirLogTypeAfterTheFirstOfAnInterval) {
  EXPECT_THAT(findDlfRecords(plain(14) + hex("01") + plain(14) + hex("FF") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 0, 14}, DlfRecordPlace{14, 15, 29}, DlfRecordPlace{29, 30, 42}));
}

TEST(DlfRecords, GoOnWithoutATypeWhereTheNextIntervalBegins) {
  EXPECT_THAT(findDlfRecords(plain(12) + hex("01") + plain(12) + plain(12) + hex("01") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 13, 25}, DlfRecordPlace{25, 25, 37},
                          DlfRecordPlace{37, 38, 50}));
}

TEST(DlfRecords, MayHaveAPrefixAndLoseItsFirstByte) {
  EXPECT_THAT(findDlfRecords(hex("07 01") + plain(12) + hex("81 07 FF") + plain(12)),
              ElementsAre(DlfRecordPlace{0, 2, 14}, DlfRecordPlace{14, 17, 29}));
}

TEST(DlfRecords, MayBeOf257Or255BytesWithoutAType) {
  for (const std::size_t size : {255u, 257u, 511u, 513u}) {
    EXPECT_THAT(findDlfRecords(plain(12) + plain(size) + plain(12)),
                ElementsAre(DlfRecordPlace{0, 0, 12}, DlfRecordPlace{12, 12, 12 + size},
                            DlfRecordPlace{12 + size, 12 + size, 24 + size}))
        << size;
  }
}

// 01 0E read as a length is 0x0E01 = 3585, and 3585 = 239 * 15: from one log type to another.
TEST(DlfRecords, OutnumberTheLongRecordThatALogTypeCouldBegin) {
  Bytes file = plain(14);
  for (int count = 0; count < 300; ++count) file = file + hex("01") + plain(14);
  EXPECT_EQ(findDlfRecords(file).size(), 301u);
}

TEST(DlfRecords, EndBeforeOneThatIsCut) {
  const Bytes cut = plain(12) + hex("01") + plain(20);
  EXPECT_THAT(findDlfRecords(std::span(cut).first(32)), ElementsAre(DlfRecordPlace{0, 0, 12}));
}

TEST(DlfRecords, AreNotFoundInWhatIsTooShortToHoldOne) {
  EXPECT_THAT(findDlfRecords({}), IsEmpty());
  EXPECT_THAT(findDlfRecords(hex("0B00 3171 00000000 00000000")), IsEmpty());
  EXPECT_THAT(findDlfRecords(hex("0C00 3171 00000000 000000")), IsEmpty());
}

TEST(DlfRecords, StayBoundedInAFileThatCanBeReadAtEveryByte) {
  EXPECT_FALSE(findDlfRecords(Bytes(100'000, 0x01)).empty());
}

}  // namespace
}  // namespace kelvasi
