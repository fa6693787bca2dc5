// SPDX-License-Identifier: Apache-2.0
#include "Radio/NetworkId.h"

#include <algorithm>
#include <cstddef>

namespace kelvasi {

namespace {

constexpr std::int64_t largest = 999;
constexpr std::int64_t firstOfThreeDigits = 100;

bool isDigit(char character) {
  return '0' <= character && character <= '9';
}

std::optional<std::uint16_t> numberIn(std::string_view digits, std::size_t least, std::size_t most) {
  if (digits.size() < least || digits.size() > most || !std::ranges::all_of(digits, isDigit))
    return std::nullopt;
  unsigned number = 0;
  for (const char digit : digits) number = 10 * number + static_cast<unsigned>(digit - '0');
  return static_cast<std::uint16_t>(number);
}

std::string_view withoutBlanksAfter(std::string_view text) {
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

std::string inDigits(std::uint16_t number, std::size_t digits) {
  const std::string text = std::to_string(number);
  return std::string(digits - std::min(digits, text.size()), '0') + text;
}

}  // namespace

std::optional<NetworkId> networkIdFromDigits(std::string_view mcc, std::string_view mnc) {
  mnc = withoutBlanksAfter(mnc);
  const auto country = numberIn(withoutBlanksAfter(mcc), 3, 3);
  const auto network = numberIn(mnc, 2, 3);
  if (!country || !network) return std::nullopt;
  return NetworkId{*country, *network, static_cast<std::uint8_t>(mnc.size())};
}

std::optional<NetworkId> networkIdFromNumbers(std::int64_t mcc, std::int64_t mnc) {
  if (mcc < 0 || mcc > largest || mnc < 0 || mnc > largest) return std::nullopt;
  return NetworkId{static_cast<std::uint16_t>(mcc), static_cast<std::uint16_t>(mnc),
                   static_cast<std::uint8_t>(mnc < firstOfThreeDigits ? 0 : 3)};
}

std::string textOf(const NetworkId& network) {
  const std::size_t digits = network.mncDigits == 0 ? 2 : network.mncDigits;
  return inDigits(network.mcc, 3) + "-" + inDigits(network.mnc, digits);
}

}  // namespace kelvasi
