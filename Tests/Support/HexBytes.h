// SPDX-License-Identifier: Apache-2.0
// Records typed by hand.
#pragma once

#include <cstddef>
#include <string_view>

#include "LogGenerator/LogCode.h"
#include "Plist/PlistValue.h"

namespace kelvasi::test {

// Bytes from pairs of hexadecimal digits; blanks between pairs are free. Throws std::invalid_argument
// otherwise.
Bytes hex(std::string_view digits);

// A record of this effective log code: a header typed out as 01 or FF, two zeros, the code, eight zeros; then
// the payload, then zeros up to `length` bytes in all.
Bytes record(LogCode logCode, std::string_view payload, std::size_t length = 0);

// The same with a payload that is text, such as a property list.
Bytes textRecord(LogCode logCode, std::string_view payload);

}  // namespace kelvasi::test
