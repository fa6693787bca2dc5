// SPDX-License-Identifier: Apache-2.0
#include "Dlf/QuarnDLFAddVersionReport.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::hex;

struct Report {
  explicit Report(std::size_t size, std::string_view version = "Kelvasi 1.0",
                  std::string_view executable = "tool", std::string_view build = "Jun  6 2017 22:20:30",
                  DlfCreationTime created = {})
      : buffer(size, 0xEE),
        result(QuarnDLFAddVersionReport(buffer, written, 1, 0x0203, version, executable, build, created)) {}

  Bytes part(std::ptrdiff_t at, std::ptrdiff_t size) const {
    return Bytes(buffer.begin() + at, buffer.begin() + at + size);
  }

  Bytes buffer;
  std::uint32_t written = 77;
  int result;
};

TEST(QuarnDLFAddVersionReport, RefusesABufferOf160BytesAndLeavesItAlone) {
  const Report report(160);
  EXPECT_EQ(report.result, 3);
  EXPECT_EQ(report.written, 0u);
  EXPECT_EQ(report.buffer, Bytes(160, 0xEE));
}

TEST(QuarnDLFAddVersionReport, WritesExactly161Bytes) {
  const Report report(170);
  EXPECT_EQ(report.result, 0);
  EXPECT_EQ(report.written, 161u);
  EXPECT_EQ(report.part(161, 9), Bytes(9, 0xEE));
}

TEST(QuarnDLFAddVersionReport, StartsWithLengthCodeTimeAndReportNumbers) {
  EXPECT_EQ(Report(161).part(0, 16), hex("A100 FD1F 0000000000000000 0100 0302"));
}

TEST(QuarnDLFAddVersionReport, CutsTheVersionTo6Characters) {
  EXPECT_EQ(Report(161, "Kelvasi 99").part(16, 7), hex("4B 65 6C 76 61 73 00"));
  EXPECT_EQ(Report(161, "abc").part(16, 7), hex("61 62 63 00 00 00 00"));
}

TEST(QuarnDLFAddVersionReport, CutsTheExecutableTo15Characters) {
  EXPECT_EQ(Report(161, "v", "EXECUTABLE_NAME").part(23, 16), hex("45584543555441424C455F4E414D45 00"));
  EXPECT_EQ(Report(161, "v", "EXECUTABLE_NAME_").part(23, 16), hex("45584543555441424C455F4E414D45 00"));
}

TEST(QuarnDLFAddVersionReport, CutsTheBuildTimeTo17Characters) {
  const Bytes field = Report(161).part(63, 18);
  EXPECT_EQ(std::string(field.begin(), field.begin() + 17), "Jun  6 2017 22:20");
  EXPECT_EQ(field.back(), 0);
}

TEST(QuarnDLFAddVersionReport, WritesTheCreationTime) {
  const DlfCreationTime created{.seconds = 0x12345678, .zoneOffsetInMinutes = -210, .daylightSaving = 1};
  EXPECT_EQ(Report(161, "v", "e", "b", created).part(81, 8), hex("78563412 2EFF 0100"));
}

TEST(QuarnDLFAddVersionReport, LeavesTheReservedBytesZero) {
  const Report report(161);
  EXPECT_EQ(report.part(39, 24), Bytes(24));
  EXPECT_EQ(report.part(89, 72), Bytes(72));
}

}  // namespace
}  // namespace kelvasi
