// SPDX-License-Identifier: Apache-2.0
// A capture: log-channel messages, as delivered with id 0, in the order in which they arrived.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "Capture/CaptureFault.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

struct CapturedMessage {
  std::span<const std::uint8_t> bytes;  // last until the next read
  std::chrono::nanoseconds arrival{0};  // since 1 January 1970 UTC, never negative
};

class CaptureReader {
 public:
  virtual ~CaptureReader() = default;

  // The next whole message. Nothing at the end and after a fault; what was read before a fault has been
  // delivered by then.
  virtual std::optional<CapturedMessage> next() = 0;
  // How much of the file was read, to show how far that is.
  virtual std::uint64_t filePosition() const { return 0; }
  // Why the capture ends before its end. Set at the latest when next() has returned nothing.
  const std::optional<CaptureFault>& fault() const { return fault_; }
  // Everything that could not be read, in lines for people: messages of which the capture holds only the
  // beginning, which were skipped, and at last the fault. Empty when all was well.
  std::vector<std::string> complaints() const;

 protected:
  // Of many such messages only the first are named.
  void skip(CaptureFault message);

  std::optional<CaptureFault> fault_;

 private:
  std::vector<CaptureFault> skipped_;
  std::uint64_t skippedCount_ = 0;
};

// Opens a pcap, pcapng or DLF file or a snapshot, each also packed with gzip or zstd; "-" is the standard
// input. A DLF file is told by its
// version report or by its name's ending ".dlf", a snapshot as a property list or by ".kelvasi". Never null:
// what cannot be opened or read is a capture without messages and with a fault. `plists` is needed until the
// call returns.
std::unique_ptr<CaptureReader> openCapture(const std::string& path, const PlistSerialiser& plists);

}  // namespace kelvasi
