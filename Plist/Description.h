// SPDX-License-Identifier: Apache-2.0
// The textual description of property-list values, as "%@" prints them in log lines and snapshot texts.
#pragma once

#include <string>

#include "Plist/PlistValue.h"

namespace kelvasi {

// A date as yyyy-MM-dd HH:mm:ss in UTC, a blank and "+0000"; the fraction of a second is dropped.
std::string description(PlistDate date);

// Strings stand as they are at the top and are quoted where needed inside a container; dictionaries and
// arrays are written one entry a line, indented by four blanks a level; an absent value is "(null)".
std::string description(const PlistValue& value);

}  // namespace kelvasi
