// SPDX-License-Identifier: Apache-2.0
#include "Dlf/QuarnDLFAddVersionReport.h"

#include <algorithm>

namespace kelvasi {

namespace {

constexpr std::uint16_t versionReportLogCode = 0x1FFD;

// Where a text stands in the record, its terminating zero included.
struct TextField {
  std::size_t at;
  std::size_t size;
};
constexpr TextField versionField{16, 7};
constexpr TextField executableField{23, 16};
constexpr TextField buildField{63, 18};

void put(std::span<std::uint8_t> record, std::size_t at, std::uint32_t value, std::size_t size) {
  for (std::size_t byte = 0; byte < size; ++byte)
    record[at + byte] = static_cast<std::uint8_t>(value >> (8 * byte));
}

void put(std::span<std::uint8_t> record, TextField field, std::string_view text) {
  std::ranges::copy(text.substr(0, field.size - 1), record.begin() + static_cast<std::ptrdiff_t>(field.at));
}

}  // namespace

int QuarnDLFAddVersionReport(std::span<std::uint8_t> buffer, std::uint32_t& written,
                             std::uint16_t firstReport, std::uint16_t secondReport, std::string_view version,
                             std::string_view executable, std::string_view build, DlfCreationTime created) {
  written = 0;
  if (buffer.size() < dlfVersionReportSize) return dlfBufferTooShort;
  const std::span<std::uint8_t> record = buffer.first(dlfVersionReportSize);
  std::ranges::fill(record, std::uint8_t{0});
  put(record, 0, dlfVersionReportSize, 2);
  put(record, 2, versionReportLogCode, 2);
  put(record, 12, firstReport, 2);
  put(record, 14, secondReport, 2);
  put(record, versionField, version);
  put(record, executableField, executable);
  put(record, buildField, build);
  put(record, 81, created.seconds, 4);
  put(record, 85, static_cast<std::uint16_t>(created.zoneOffsetInMinutes), 2);
  put(record, 87, created.daylightSaving, 2);
  written = dlfVersionReportSize;
  return dlfSuccess;
}

}  // namespace kelvasi
