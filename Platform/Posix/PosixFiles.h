// SPDX-License-Identifier: Apache-2.0
// The file system.
#pragma once

#include "Platform/Files.h"

namespace kelvasi {

class PosixFiles : public Files {
 public:
  bool exists(const std::string& path) const override;
  bool write(const std::string& path, std::span<const std::uint8_t> bytes) override;
};

}  // namespace kelvasi
