// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PosixFiles.h"

#include <unistd.h>

#include "Platform/Posix/Files.h"

namespace kelvasi {

bool PosixFiles::exists(const std::string& path) const {
  return ::access(path.c_str(), F_OK) == 0;
}

bool PosixFiles::write(const std::string& path, std::span<const std::uint8_t> bytes) {
  return !writeFile(path, bytes);
}

}  // namespace kelvasi
