// SPDX-License-Identifier: Apache-2.0
// What of a capture could not be read.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace kelvasi {

struct CaptureFault {
  std::string file;
  std::optional<std::uint64_t> offset;  // of what could not be read; nothing when the file was not opened,
                                        // and where it is wrong as a whole
  std::string reason;

  // One line: "drive.pcap: byte 1024: truncated dump file"
  std::string text() const;
};

}  // namespace kelvasi
