// SPDX-License-Identifier: Apache-2.0
// The snapshot file: a property list of save contents with a description.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

// "Timestamp" (the date as text), "Data" (the save contents) and "Description", in this order; the first one
// that is absent ends the list.
PlistValue::Dictionary snapshotDictionary(PlistDate timeStamp, const PlistValue& saveHistory,
                                          const std::optional<std::string>& text);

// Where a snapshot saved at `moment` goes; two within a second share a path.
std::string snapshotPath(std::string_view directory, PlistDate moment);

}  // namespace kelvasi
