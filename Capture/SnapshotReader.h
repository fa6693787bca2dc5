// SPDX-License-Identifier: Apache-2.0
// A snapshot, the property list that Save writes, as the log-channel messages of its DLF file (DlfReader.h):
// those of the display intervals that it kept, at most five.
#pragma once

#include <optional>
#include <string>

#include "Capture/CaptureReader.h"
#include "Capture/DlfReader.h"
#include "Capture/InputBytes.h"
#include "Platform/Plist/PlistLimits.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

class SnapshotReader : public CaptureReader {
 public:
  static constexpr std::size_t largestFile = plistLimits::documentBytes;

  // Reads the whole input. What is larger than `largestFile`, is no property list that `plists` parses, no
  // snapshot, or one without a DLF file is a fault.
  SnapshotReader(InputBytes& input, const PlistSerialiser& plists);

  // A fault inside the DLF file names its place there.
  std::optional<CapturedMessage> next() override;

 private:
  void open(const PlistValue& snapshot);
  void fail(std::string reason);

  std::string name_;
  std::optional<DlfReader> dlf_;
};

}  // namespace kelvasi
