// SPDX-License-Identifier: Apache-2.0
// Property-list values made up from a seed, and texts of values that tell every difference.
#pragma once

#include <cstdint>
#include <random>
#include <span>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi::testing {

// Values that every format and reader can hold as they are: texts of XML characters, whole dates, no -0.0.
class PlistSamples {
 public:
  explicit PlistSamples(std::uint64_t seed) : random_(seed) {}

  // Any kind; containers are nested up to `levels` deep.
  PlistValue value(int levels = 5);

 private:
  std::int64_t number(std::int64_t least, std::int64_t most);
  PlistValue integer();
  std::string text();
  Bytes bytes();
  double real();
  PlistValue array(int levels);
  PlistValue dictionary(int levels);

  std::mt19937_64 random_;
};

// One text for each value, reals to the bit, dictionaries in stored order.
std::string canonical(const PlistValue& value);

std::span<const std::uint8_t> bytesOf(std::string_view text);
std::string textOf(std::span<const std::uint8_t> bytes);
// An XML property list with this inside its plist element.
std::string xmlPlist(std::string_view body);
// `body` within `levels` arrays.
std::string inArrays(int levels, std::string_view body = "");

}  // namespace kelvasi::testing
