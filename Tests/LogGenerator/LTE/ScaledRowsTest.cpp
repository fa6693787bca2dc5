// SPDX-License-Identifier: Apache-2.0
// Every raw value of every measurement, against printf.
#include <gtest/gtest.h>

#include <cstdio>

#include "LogGenerator/LTE/MeasurementScales.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

constexpr std::array layout{Field{.name = "raw", .byte = 0, .width = 16}};

std::string shown(const Scale& scale, unsigned raw) {
  const Row row{.key = "k", .quantity = quantity::rsrp, .unit = " dBm", .scale = scale};
  const Bytes bytes{static_cast<std::uint8_t>(raw), static_cast<std::uint8_t>(raw >> 8)};
  return textOf(row, rawOf(RecordView(bytes), layout, row));
}

std::string byPrintf(double factor, double offset, unsigned raw) {
  std::array<char, 64> text;
  std::snprintf(text.data(), text.size(), "%4.2f dBm", raw * factor + offset);
  return text.data();
}

void expectAsPrintf(const Scale& scale, double factor, double offset) {
  for (unsigned raw = 0; raw < 65536; ++raw) ASSERT_EQ(shown(scale, raw), byPrintf(factor, offset, raw));
}

TEST(ScaledRows, RsrpInQuarters) {
  expectAsPrintf(lte::quarterRsrp, 0.25, -140);
}
TEST(ScaledRows, RsrpInHalves) {
  expectAsPrintf(lte::halfRsrp, 0.5, -140);
}
TEST(ScaledRows, RsrqInQuarters) {
  expectAsPrintf(lte::quarterRsrq, 0.25, -30);
}
TEST(ScaledRows, RsrqInEighths) {
  expectAsPrintf(lte::eighthRsrq, 0.125, -20);
}
TEST(ScaledRows, RssiInHalves) {
  expectAsPrintf(lte::halfRssi, 0.5, -140);
}
TEST(ScaledRows, OtherScalesAndFormatsGoToPrintf) {
  expectAsPrintf(Scale{.factor = 0.1, .offset = -7}, 0.1, -7);
  EXPECT_EQ(shown(Scale{.factor = 0.00390625, .format = "%f"}, 17), "0.066406 dBm");
}

}  // namespace
}  // namespace kelvasi
