// SPDX-License-Identifier: Apache-2.0
// Replaces what identifies a subscriber, a device or a place in the messages of the log channel, of any
// technology, where it stands: a message stays as long as it was, and whatever else it says.
#pragma once

#include <map>
#include <set>
#include <span>
#include <string_view>
#include <vector>

#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/RowCatalog.h"
#include "Redaction/PlistRedactor.h"

namespace kelvasi {

class MessageRedactor {
 public:
  // The rows of all technologies, which outlast the call only as far as the process does.
  MessageRedactor(std::span<const RowCatalog> catalogs, const PlistSerialiser& plists,
                  const Replacement& replacement, RedactionChoice choice);
  MessageRedactor(const MessageRedactor&) = delete;
  MessageRedactor& operator=(const MessageRedactor&) = delete;

  void redact(std::span<std::uint8_t> message);
  // A property list that is no message. False when it could not be read; it is then not redacted.
  bool redactPlist(std::span<std::uint8_t> document, const PlistRedactor::Nested& nested = {});
  // A text for people, such as a comment of a capture.
  void redactText(std::span<std::uint8_t> text);
  // What nobody knows.
  void redactUnknown(std::span<std::uint8_t> bytes);
  // What nobody can read.
  void blank(std::span<std::uint8_t> bytes);

  const RemovedIdentities& removed() const { return removed_; }
  const RedactionCounts& counts() const { return counts_; }

 private:
  struct Place {
    Field field;
    NamedValue value;
  };

  void learn(const CatalogRow& row);
  void redactFields(std::span<std::uint8_t> record, std::span<const Place> places);
  void redactListIn(std::span<std::uint8_t> message, std::span<std::uint8_t> record);

  const PlistSerialiser& plists_;
  const Replacement& replacement_;
  RedactionChoice choice_;
  NameBook book_;
  std::map<LogCode, std::vector<Place>> places_;  // an entry for each code that is known
  std::set<LogCode> listCodes_;                   // of records that hold a property list
  PlistRedactor plistRedactor_;
  RemovedIdentities removed_;
  RedactionCounts counts_;
};

}  // namespace kelvasi
