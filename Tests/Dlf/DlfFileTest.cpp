// SPDX-License-Identifier: Apache-2.0
#include "Dlf/DlfFile.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using test::hex;

Bytes part(const Bytes& dlf, std::ptrdiff_t at, std::ptrdiff_t size) {
  return Bytes(dlf.begin() + at, dlf.begin() + at + size);
}

TEST(DlfFile, AnyBundleVersionShowsAsTheFirstSixCharactersOfTheName) {
  for (const char* version : {"", "1.0", "99.99.99"}) {
    test::TestPlatform surroundings;
    surroundings.resources.version = version;
    EXPECT_EQ(part(*beginDlf(surroundings.platform()), 16, 7), hex("4B 65 6C 76 61 73 00")) << version;
  }
}

TEST(DlfFile, WithoutABundleVersionTheTextIsNone) {
  test::TestPlatform surroundings;
  surroundings.resources.version.reset();
  EXPECT_EQ(part(*beginDlf(surroundings.platform()), 16, 7), hex("28 6E 6F 6E 65 29 00"));  // "(none)"
}

TEST(DlfFile, CarriesTheReportNumbersAndTheExecutableName) {
  test::TestPlatform surroundings;
  const Bytes dlf = *beginDlf(surroundings.platform());
  EXPECT_EQ(part(dlf, 12, 4), hex("0100 0100"));
  EXPECT_EQ(part(dlf, 23, 15), hex("45584543555441424C455F4E414D45"));
}

TEST(DlfFile, DropsTheFractionOfTheSecond) {
  test::TestPlatform surroundings;
  surroundings.clock.time = PlistDate{1.999};
  EXPECT_EQ(part(*beginDlf(surroundings.platform()), 81, 4), hex("01000000"));
}

struct ZoneCase {
  int seconds;
  std::int16_t minutes;
};

TEST(DlfFile, HoldsTheZoneInMinutesTruncatedTowardZero) {
  for (const auto& [seconds, minutes] : {ZoneCase{-12600, -210}, ZoneCase{20700, 345}, ZoneCase{-59, 0},
                                         ZoneCase{-61, -1}, ZoneCase{3599, 59}}) {
    test::TestPlatform surroundings;
    surroundings.clock.zone = {.secondsFromGmt = seconds, .isDaylightSaving = false};
    const Bytes field = part(*beginDlf(surroundings.platform()), 85, 2);
    EXPECT_EQ(static_cast<std::int16_t>(field[0] | (field[1] << 8)), minutes) << seconds;
  }
}

// A zone that went over to summer time this year.
struct ZoneThatChanged : test::FakeClock {
  ZoneState localZone(PlistDate at) const override {
    const bool isSummer = at.secondsSince1970 >= 1711846800;  // 2024-03-31 01:00:00 UTC
    return {.secondsFromGmt = isSummer ? 7200 : 3600, .isDaylightSaving = isSummer};
  }
};

TEST(DlfFile, HoldsTheZoneAsItIsAtItsCreation) {
  test::TestPlatform surroundings;
  ZoneThatChanged clock;
  const Platform platform{surroundings.log, surroundings.trace, surroundings.plists, surroundings.resources,
                          clock};
  clock.time = PlistDate{1711846799};
  EXPECT_EQ(part(*beginDlf(platform), 85, 4), hex("3C00 0000"));
  clock.time = PlistDate{1711846800};
  EXPECT_EQ(part(*beginDlf(platform), 85, 4), hex("7800 0100"));
}

TEST(DlfFile, SaysWhenTheHeaderFindsNoRoom) {
  test::TestPlatform surroundings;
  Bytes tooShort(160, 0xAA);
  EXPECT_FALSE(writeDlfHeader(surroundings.platform(), tooShort));
  EXPECT_EQ(surroundings.log.lines(LogPriority::dlf),
            std::vector<std::string>{"Could not write DLF header (result=3)"});
  EXPECT_EQ(tooShort, Bytes(160, 0xAA));
}

TEST(DlfFile, FlagsDaylightSaving) {
  test::TestPlatform surroundings;
  EXPECT_EQ(part(*beginDlf(surroundings.platform()), 87, 2), hex("0000"));
  surroundings.clock.zone.isDaylightSaving = true;
  EXPECT_EQ(part(*beginDlf(surroundings.platform()), 87, 2), hex("0100"));
}

}  // namespace
}  // namespace kelvasi
