// SPDX-License-Identifier: Apache-2.0
// A capture written once more with its messages redacted: a file of the same kind, each byte where it was.
// One that is packed comes out unpacked.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>

#include "Capture/CaptureFault.h"
#include "Redaction/MessageRedactor.h"

namespace kelvasi {

// False when it could not be written; nothing more is then given.
using PutBytes = std::function<bool(std::span<const std::uint8_t> bytes)>;

// Reads a capture as openCapture() does. Where it cannot be read on, the rest is left out and the fault says
// where that is. Link types other than USER0 are a fault.
std::optional<CaptureFault> redactCapture(const std::string& path, MessageRedactor& redactor,
                                          const PutBytes& put);

}  // namespace kelvasi
