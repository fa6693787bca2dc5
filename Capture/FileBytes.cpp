// SPDX-License-Identifier: Apache-2.0
#include "Capture/FileBytes.h"

namespace kelvasi {

FileBytes::FileBytes(const std::string& path) : file_(path) {
  if (file_.error()) fault_ = CaptureFault{name(), std::nullopt, file_.error().message()};
}

std::ptrdiff_t FileBytes::read(std::span<std::uint8_t> block) {
  if (fault_) return -1;
  const std::ptrdiff_t count = file_.read(block);
  if (count < 0) fault_ = CaptureFault{name(), position(), file_.error().message()};
  return count;
}

}  // namespace kelvasi
