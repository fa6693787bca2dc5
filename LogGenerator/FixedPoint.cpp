// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/FixedPoint.h"

#include <charconv>
#include <cmath>
#include <cstdint>

namespace kelvasi {

namespace {

constexpr double limit = 4294967296.0;
constexpr std::size_t room = 16;

// An eighth is 12.5 hundredths, so that half of an odd number of eighths is a tie.
std::uint64_t hundredthsOf(std::uint64_t eighths) {
  const std::uint64_t halves = eighths * 25;
  const std::uint64_t below = halves / 2;
  return below + (halves & below & 1);
}

}  // namespace

char* writeHundredths(char* to, double value) {
  const double magnitude = std::fabs(value) * 8;
  if (!(magnitude < limit * 8)) return nullptr;  // not a number neither
  const auto eighths = static_cast<std::uint64_t>(static_cast<std::int64_t>(magnitude));
  if (static_cast<double>(static_cast<std::int64_t>(eighths)) != magnitude) return nullptr;
  const std::uint64_t shown = hundredthsOf(eighths);
  char* end = to;
  if (std::signbit(value)) *end++ = '-';
  end = std::to_chars(end, to + room, shown / 100).ptr;
  *end++ = '.';
  *end++ = static_cast<char>('0' + shown / 10 % 10);
  *end++ = static_cast<char>('0' + shown % 10);
  return end;
}

}  // namespace kelvasi
