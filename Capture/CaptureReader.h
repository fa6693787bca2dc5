// A capture: log-channel messages, as delivered with id 0, in the order in which they arrived.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "Platform/PlistSerialiser.h"

namespace kelvasi {

struct CapturedMessage {
  std::span<const std::uint8_t> bytes;  // last until the next read
  std::chrono::nanoseconds arrival{0};  // since 1 January 1970 UTC, never negative
};

// Why a capture ends before its end.
struct CaptureFault {
  std::string file;
  std::optional<std::uint64_t> offset;  // of what could not be read; nothing when the file was not opened,
                                        // and where it is wrong as a whole
  std::string reason;

  // One line: "drive.pcap: byte 1024: truncated dump file"
  std::string text() const;
};

class CaptureReader {
 public:
  virtual ~CaptureReader() = default;

  // Nothing at the end and after a fault; what was read before a fault has been delivered by then.
  virtual std::optional<CapturedMessage> next() = 0;
  // Set at the latest when next() has returned nothing.
  const std::optional<CaptureFault>& fault() const { return fault_; }
  // How many of the messages read so far the capture holds only the beginning of.
  std::uint64_t cutMessages() const { return cutMessages_; }

 protected:
  std::optional<CaptureFault> fault_;
  std::uint64_t cutMessages_ = 0;
};

// Opens a pcap, pcapng or DLF file or a snapshot; "-" is the standard input. A DLF file is told by its
// version report or by its name's ending ".dlf", a snapshot as a property list or by ".kelvasi". Never null:
// what cannot be opened or read is a capture without messages and with a fault. `plists` is needed until the
// call returns.
std::unique_ptr<CaptureReader> openCapture(const std::string& path, const PlistSerialiser& plists);

}  // namespace kelvasi
