// SPDX-License-Identifier: Apache-2.0
// The little that is asked of the file system.
#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace kelvasi {

class Files {
 public:
  virtual ~Files() = default;

  virtual bool exists(const std::string& path) const = 0;
  // Writes a whole file straight to its path, replacing what is there. False when that fails; the path then
  // has what it had before.
  virtual bool write(const std::string& path, std::span<const std::uint8_t> bytes) = 0;
};

}  // namespace kelvasi
