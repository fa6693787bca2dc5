// A DLF file, plain or from a snapshot (DlfRecords.h), as log-channel messages.
//
// - A version report at the beginning is no message.
// - A message keeps the log type and prefix that stand before its record. A record without one becomes a
//   message of log type 1, or 0xFF, one of the daemon's own, when its payload is a property list.
// - The time stamp is taken for CDMA system time as 3GPP2 C.S0002 has it: since 6 January 1980, the upper 48
//   bits in units of 1.25 ms, the lower 16 a fraction of that; leap seconds are not taken off. A record
//   without a stamp has the time of the one before; at the beginning of the file, that of the first stamp, or
//   1970 where there is no stamp at all.
// - Records are found by their lengths, so a message whose length field is wrong ends what can be read of a
//   snapshot's DLF file.
#pragma once

#include <vector>

#include "Capture/CaptureReader.h"
#include "Capture/DlfRecords.h"
#include "Capture/InputBytes.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class DlfReader : public CaptureReader {
 public:
  static constexpr std::size_t largestFile = std::size_t{256} << 20;

  // Reads the whole input; a larger one than `largestFile` is a fault.
  explicit DlfReader(InputBytes& input);
  // `name` stands for the file in a fault.
  DlfReader(std::string name, Bytes file);

  std::optional<CapturedMessage> next() override;

 private:
  void findRecords();
  bool isVersionReport(const DlfRecordPlace& place) const;
  std::optional<std::chrono::nanoseconds> stampOf(const DlfRecordPlace& place) const;
  std::span<const std::uint8_t> messageOf(const DlfRecordPlace& place);

  std::string name_;
  Bytes file_;
  std::vector<DlfRecordPlace> records_;
  std::size_t nextRecord_ = 0;
  std::optional<CaptureFault> faultAtEnd_;
  std::chrono::nanoseconds time_{0};  // of the record last read
  Bytes typed_;                       // a record with the log type that it lacked
};

}  // namespace kelvasi
