// SPDX-License-Identifier: Apache-2.0
#include "Dlf/DlfFile.h"

#include <string>

#include "Dlf/QuarnDLFAddVersionReport.h"
#include "Platform/Clock.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

std::string versionText(const Resources& resources) {
  const auto version = resources.bundleVersion();
  return version ? "Kelvasi " + *version : "(none)";
}

DlfCreationTime creationTime(const Clock& clock) {
  const PlistDate now = clock.now();
  const ZoneState zone = clock.localZone(now);
  return {.seconds = static_cast<std::uint32_t>(now.secondsSince1970),
          .zoneOffsetInMinutes = static_cast<std::int16_t>(zone.secondsFromGmt / 60),
          .daylightSaving = static_cast<std::uint8_t>(zone.isDaylightSaving ? 1 : 0)};
}

}  // namespace

bool writeDlfHeader(const Platform& platform, std::span<std::uint8_t> header) {
  std::uint32_t written = 0;
  const int result =
      QuarnDLFAddVersionReport(header, written, 1, 1, versionText(platform.resources), "EXECUTABLE_NAME",
                               platform.resources.buildTime(), creationTime(platform.clock));
  if (result != dlfSuccess) {
    platform.log.print(LogPriority::dlf, "Could not write DLF header (result=%d)", result);
  }
  return result == dlfSuccess;
}

std::optional<Bytes> beginDlf(const Platform& platform) {
  Bytes dlf(dlfVersionReportSize);
  if (!writeDlfHeader(platform, dlf)) return std::nullopt;
  return dlf;
}

void appendDlfInterval(Bytes& dlf, std::span<const std::uint8_t> rawMessages) {
  if (rawMessages.size() < 2) return;
  dlf.insert(dlf.end(), rawMessages.begin() + 1, rawMessages.end());
}

}  // namespace kelvasi
