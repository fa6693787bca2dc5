// SPDX-License-Identifier: Apache-2.0
#include "Model/SnapshotFile.h"

#include <array>
#include <cmath>
#include <utility>

#include "Plist/Description.h"

namespace kelvasi {

PlistValue::Dictionary snapshotDictionary(PlistDate timeStamp, const PlistValue& saveHistory,
                                          const std::optional<std::string>& text) {
  const std::array entries{
      std::pair{"Timestamp", PlistValue(description(timeStamp))},
      std::pair{"Data", saveHistory},
      std::pair{"Description", text ? PlistValue(*text) : PlistValue()},
  };
  const auto snapshot = PlistDictionary::make();
  for (const auto& [key, value] : entries) {
    if (value.isAbsent()) break;
    snapshot->set(key, value);
  }
  return snapshot;
}

std::string snapshotPath(std::string_view directory, PlistDate moment) {
  const auto seconds = static_cast<long>(std::floor(moment.secondsSince1970));
  return std::string(directory) + "/KelvasiSnapshot-" + std::to_string(seconds) + ".kelvasi";
}

}  // namespace kelvasi
