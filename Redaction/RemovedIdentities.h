// SPDX-License-Identifier: Apache-2.0
// The identities of subscriber and device that were replaced, to look whether one of them is still there.
#pragma once

#include <cstdint>
#include <set>
#include <span>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

class RemovedIdentities {
 public:
  void addText(std::string_view text) { texts_.emplace(text); }
  void addBytes(std::span<const std::uint8_t> bytes) { bytes_.emplace(bytes.begin(), bytes.end()); }

  const std::set<std::string>& texts() const { return texts_; }
  const std::set<Bytes>& bytes() const { return bytes_; }

 private:
  std::set<std::string> texts_;
  std::set<Bytes> bytes_;
};

}  // namespace kelvasi
