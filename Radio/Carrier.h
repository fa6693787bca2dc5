// SPDX-License-Identifier: Apache-2.0
// What a channel number stands for: a band and its frequencies.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Radio/Frequency.h"

namespace kelvasi {

struct Band {
  std::uint16_t number = 0;  // as the standard counts; GSM's bands by their MHz
  std::string_view name;     // short, as engineers write it: "B7", "Band VIII", "DCS 1800", "BC0"

  bool operator==(const Band&) const = default;
};

// The centre frequencies, at the band's usual distance between them; both the same where one frequency serves
// both ways (TDD). A downlink without a partner of its own has no uplink.
struct Carrier {
  Band band;
  Frequency downlink;
  std::optional<Frequency> uplink;

  bool operator==(const Carrier&) const = default;
};

// Every carrier that a number may stand for, in the order of the bands; none for a number of no band. Holds
// its carriers itself.
class Carriers {
 public:
  static constexpr std::size_t most = 16;

  constexpr void add(const Carrier& carrier) { carriers_.at(size_++) = carrier; }

  constexpr const Carrier* begin() const { return carriers_.data(); }
  constexpr const Carrier* end() const { return carriers_.data() + size_; }
  constexpr std::size_t size() const { return size_; }
  constexpr bool empty() const { return size_ == 0; }
  constexpr const Carrier& operator[](std::size_t at) const { return carriers_[at]; }

 private:
  std::array<Carrier, most> carriers_{};
  std::size_t size_ = 0;
};

// Bands and downlinks for people, all of them: "B7 2680 MHz", "DCS 1800 1879.8 MHz or PCS 1900 2004.8 MHz".
// Empty for none.
std::string textOf(const Carriers& carriers);

}  // namespace kelvasi
