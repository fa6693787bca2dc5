// SPDX-License-Identifier: Apache-2.0
// What stands in the place of an identity: as many bytes, of the same shape. Blank, or by a key a pseudonym
// that is the same wherever the identity is.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "Platform/KeyedHash.h"

namespace kelvasi {

class Replacement {
 public:
  // Blank without a hash. `hash` outlives it.
  explicit Replacement(const KeyedHash* hash = nullptr) : hash_(hash) {}

  // Zero; a pseudonym has as many decimal and hexadecimal digits. No two numbers of a kind share one.
  std::uint64_t number(std::string_view kind, std::uint64_t value) const;
  // Digits become digits, and everything else that is no punctuation a letter.
  void replaceText(std::span<std::uint8_t> text) const;
  void replaceBytes(std::span<std::uint8_t> bytes) const;

  bool isBlank() const { return hash_ == nullptr; }

 private:
  const KeyedHash* hash_;
};

}  // namespace kelvasi
