// SPDX-License-Identifier: Apache-2.0
#include "Plist/Encoding.h"

#include <algorithm>
#include <cmath>

#include "Plist/Description.h"

namespace kelvasi {

std::string base64(const Bytes& bytes) {
  constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  std::string text;
  for (std::size_t at = 0; at < bytes.size(); at += 3) {
    const auto byte = [&](std::size_t index) -> unsigned { return index < bytes.size() ? bytes[index] : 0; };
    const unsigned group = byte(at) << 16 | byte(at + 1) << 8 | byte(at + 2);
    for (const unsigned shift : {18u, 12u, 6u, 0u}) text += digits[group >> shift & 63];
  }
  const std::size_t padding = (3 - bytes.size() % 3) % 3;
  return text.replace(text.size() - padding, padding, padding, '=');
}

std::string iso8601(PlistDate date) {
  constexpr double firstSecond = -62'135'596'800;  // 0001-01-01
  constexpr double lastSecond = 253'402'300'799;   // 9999-12-31
  const double seconds = std::isnan(date.secondsSince1970) ? 0 : date.secondsSince1970;
  std::string text = description(PlistDate{std::clamp(seconds, firstSecond, lastSecond)});
  text.resize(19);  // of "2024-03-05 14:07:09 +0000"
  text[10] = 'T';
  text += 'Z';
  return text;
}

}  // namespace kelvasi
