// SPDX-License-Identifier: Apache-2.0
// What a property list may still hold while it is walked.
#pragma once

#include <cstddef>

namespace kelvasi {

class Allowance {
 public:
  Allowance(std::size_t values, std::size_t bytes) : values_(values), bytes_(bytes) {}

  // False when that is more than is left; the walk ends there.
  bool takeValues(std::size_t count) { return take(values_, count); }
  bool takeBytes(std::size_t count) { return take(bytes_, count); }

 private:
  static bool take(std::size_t& left, std::size_t count) {
    if (count > left) return false;
    left -= count;
    return true;
  }

  std::size_t values_;
  std::size_t bytes_;
};

}  // namespace kelvasi
