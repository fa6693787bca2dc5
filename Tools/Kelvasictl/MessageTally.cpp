// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/MessageTally.h"

#include <array>
#include <cstdio>

namespace kelvasi {

namespace {

std::string withCommas(std::uint64_t number) {
  std::string text = std::to_string(number);
  for (std::size_t at = text.size(); at > 3; at -= 3) text.insert(at - 3, ",");
  return text;
}

// Two digits that mean something.
std::string percentOf(std::uint64_t part, std::uint64_t whole) {
  const double percent = 100 * static_cast<double>(part) / static_cast<double>(whole);
  std::array<char, 32> text;
  int decimals = 0;
  for (double limit = 9.95; percent < limit && decimals < 4; limit /= 10) ++decimals;
  std::snprintf(text.data(), text.size(), "%.*f", decimals, percent);
  return text.data();
}

}  // namespace

std::string MessageTally::text() const {
  if (shown_ == messages_) return {};
  const std::string verb = messages_ == 1 ? " message was" : " messages were";
  return percentOf(messages_ - shown_, messages_) + " % of " + withCommas(messages_) + verb + " not shown";
}

}  // namespace kelvasi
