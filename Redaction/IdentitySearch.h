// SPDX-License-Identifier: Apache-2.0
// Looks for identities in bytes that come piece by piece: as text, in UTF-16 of either order, their digits as
// binary-coded decimals with either half of a byte first, and what is written in hexadecimal as bytes; all of
// it at every bit, in either order of bits.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <unordered_map>
#include <vector>

#include "Redaction/BitPattern.h"
#include "Redaction/RemovedIdentities.h"

namespace kelvasi {

class IdentitySearch {
 public:
  explicit IdentitySearch(const RemovedIdentities& identities);

  // Where the first one begins, in the bytes of all pieces so far.
  std::optional<std::uint64_t> look(std::span<const std::uint8_t> piece);
  // How many of the identities are too short, or one character again and again, and so not looked for.
  std::size_t notLookedFor() const { return notLookedFor_; }

 private:
  bool addForms(const std::string& text);
  bool add(std::span<const std::uint8_t> pattern, std::size_t bits);
  std::optional<std::size_t> find() const;
  bool isAt(const PlacedPattern& pattern, std::size_t window) const;

  std::vector<PlacedPattern> patterns_;
  std::unordered_multimap<std::uint32_t, std::size_t> byWindow_;
  std::vector<bool> windows_;  // those that some pattern has
  std::size_t longest_ = 0;
  Bytes held_;                // the end of the pieces before, and this one
  std::uint64_t before_ = 0;  // bytes before those that are held
  std::size_t notLookedFor_ = 0;
};

}  // namespace kelvasi
