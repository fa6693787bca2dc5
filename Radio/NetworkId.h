// SPDX-License-Identifier: Apache-2.0
// The number of a network: mobile country code and mobile network code (ITU-T E.212, 3GPP TS 23.003, 2.2).
#pragma once

#include <compare>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace kelvasi {

// 310-41 and 310-041 are different networks.
struct NetworkId {
  std::uint16_t mcc = 0;
  std::uint16_t mnc = 0;
  std::uint8_t mncDigits = 0;  // 2 or 3; 0 where a record gives a mere number below 100

  auto operator<=>(const NetworkId&) const = default;
};

// From the digits of a record: three, and two or three, blanks after them left out ("01 " is 01). Nothing for
// any other text.
std::optional<NetworkId> networkIdFromDigits(std::string_view mcc, std::string_view mnc);

// From mere numbers, which do not say how many digits a code below 100 has. Nothing above 999.
std::optional<NetworkId> networkIdFromNumbers(std::int64_t mcc, std::int64_t mnc);

// "262-01", "310-410"; without a number of digits at least two.
std::string textOf(const NetworkId& network);

}  // namespace kelvasi
