// SPDX-License-Identifier: Apache-2.0
// A display as JSON: dictionaries as objects in stored order, arrays, strings, integers, reals (always with a
// point or an exponent) and booleans; the absent value as null. Besides,
//   a data blob   {"$data": "<base64>"}
//   a date        {"$date": "2024-03-05T14:07:09Z"}, its fraction dropped, kept within the years 1 to 9999
//   a real that JSON cannot hold   the string "nan", "inf" or "-inf"
// Bytes of a text that are not UTF-8 become U+FFFD.
#pragma once

#include <string>

#include "Plist/PlistValue.h"

namespace kelvasi {

// Over several lines, each level indented by one blank; ends with a line feed.
std::string displayJson(const PlistValue& display);

// One line, {"time": <seconds since 1970>, "display": ...}, with its line feed.
std::string tickJson(double time, const PlistValue& display);

}  // namespace kelvasi
