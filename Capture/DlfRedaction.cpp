// SPDX-License-Identifier: Apache-2.0
#include <algorithm>

#include "Capture/DlfRecords.h"
#include "Capture/HeldBytes.h"
#include "Capture/PlistBeginning.h"
#include "Capture/RedactedFormats.h"
#include "Capture/SnapshotReader.h"

namespace kelvasi {

namespace {

constexpr std::uint16_t versionReportLogCode = 0x1FFD;

// A record with what stands before it. One without a log type is of the type that DlfReader gives it.
void redactRecord(std::span<std::uint8_t> whole, std::size_t lead, MessageRedactor& redactor) {
  const auto record = whole.subspan(lead);
  if (RecordView(record).u16(2) == versionReportLogCode) return;
  if (lead != 0) return redactor.redact(lead == 2 ? whole.subspan(1) : whole);
  Bytes typed{beginsAsPlist(record.subspan(dlfRecordHeaderSize)) ? std::uint8_t{0xFF} : std::uint8_t{0x01}};
  typed.insert(typed.end(), record.begin(), record.end());
  redactor.redact(typed);
  std::copy(typed.begin() + 1, typed.end(), record.begin());
}

std::optional<CaptureFault> redactRecords(ByteSource& source, const std::string& name,
                                          MessageRedactor& redactor, const PutBytes& put) {
  DlfRecordFinder records(source);
  while (!records.found().empty() || records.findMore()) {
    const DlfRecordPlace place = records.take();
    const auto bytes = records.bytes(place.begin, place.end);
    Bytes whole(bytes.begin(), bytes.end());
    redactRecord(whole, static_cast<std::size_t>(place.record - place.begin), redactor);
    if (!put(whole)) return std::nullopt;
  }
  if (source.fault()) return source.fault();
  if (records.bytesRead() == 0) return CaptureFault{name, 0, "an empty file"};
  if (records.end() < records.bytesRead())
    return CaptureFault{name, records.end(), "no whole DLF record begins here; the rest is left out"};
  return std::nullopt;
}

// Where a snapshot keeps messages one after the other.
bool holdsMessages(std::string_view name) {
  return name == "DLF" || name == "DisplayState";
}

}  // namespace

std::optional<CaptureFault> redactDlf(InputBytes& input, MessageRedactor& redactor, const PutBytes& put) {
  return redactRecords(input.bytes(), input.name(), redactor, put);
}

void redactDlfBytes(std::span<std::uint8_t> file, MessageRedactor& redactor) {
  HeldBytes held(Bytes(file.begin(), file.end()));
  std::size_t at = 0;
  redactRecords(held, "", redactor, [&](std::span<const std::uint8_t> record) {
    std::ranges::copy(record, file.begin() + static_cast<std::ptrdiff_t>(at));
    at += record.size();
    return true;
  });
  if (at < file.size()) redactor.blank(file.subspan(at));
}

std::optional<CaptureFault> redactSnapshot(InputBytes& input, MessageRedactor& redactor,
                                           const PutBytes& put) {
  const std::string name = input.name();
  Bytes document = input.readToEnd(SnapshotReader::largestFile, "a snapshot");
  if (input.fault()) return input.fault();
  const auto messages = [&](std::string_view key, Bytes& data) {
    if (!holdsMessages(key)) return false;
    redactDlfBytes(data, redactor);
    return true;
  };
  if (!redactor.redactPlist(document, messages))
    return CaptureFault{name, std::nullopt, "no property list that can be redacted"};
  put(document);
  return std::nullopt;
}

}  // namespace kelvasi
