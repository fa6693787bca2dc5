// SPDX-License-Identifier: Apache-2.0
// A DLF file, plain or from a snapshot (DlfRecords.h), as log-channel messages.
//
// - A version report at the beginning is no message.
// - A message keeps the log type and prefix that stand before its record. A record without one becomes a
//   message of log type 1, or 0xFF, one of the daemon's own, when its payload is a property list.
// - The time stamp is taken for CDMA system time as 3GPP2 C.S0002 has it: since 6 January 1980, the upper 48
//   bits in units of 1.25 ms, the lower 16 a fraction of that; leap seconds are not taken off. A record
//   without a stamp has the time of the one before; at the beginning of the file, that of the first stamp, or
//   1970 where there is none in the first 16 MiB.
// - Records are found by their lengths, so a message whose length field is wrong ends what can be read of a
//   snapshot's DLF file.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Capture/CaptureReader.h"
#include "Capture/DlfRecords.h"
#include "Capture/HeldBytes.h"
#include "Capture/InputBytes.h"
#include "LogGenerator/RecordView.h"

namespace kelvasi {

class DlfReader : public CaptureReader {
 public:
  explicit DlfReader(std::unique_ptr<InputBytes> input);
  // `name` stands for the file in a fault.
  DlfReader(std::string name, Bytes file);

  std::optional<CapturedMessage> next() override;
  std::uint64_t filePosition() const override { return input_ ? input_->filePosition() : 0; }

 private:
  void begin();
  bool findFirstStamp();
  void end();
  RecordView recordAt(const DlfRecordPlace& place) const;
  bool isVersionReport(const DlfRecordPlace& place) const;
  std::optional<std::chrono::nanoseconds> stampOf(const DlfRecordPlace& place) const;
  std::span<const std::uint8_t> messageOf(const DlfRecordPlace& place);

  std::string name_;
  std::unique_ptr<InputBytes> input_;  // null when the file is held
  std::optional<HeldBytes> held_;
  ByteSource& bytes_;  // of one of the two
  DlfRecordFinder records_;
  std::chrono::nanoseconds time_{0};  // of the record last read
  Bytes typed_;                       // a record with the log type that it lacked
};

}  // namespace kelvasi
