// SPDX-License-Identifier: Apache-2.0
// Replaces the identities of a property list where they stand.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <span>
#include <string>
#include <vector>

#include "Platform/PlistSerialiser.h"
#include "Redaction/NameBook.h"
#include "Redaction/PlistPieces.h"
#include "Redaction/RemovedIdentities.h"
#include "Redaction/Replacement.h"

namespace kelvasi {

struct RedactionChoice {
  bool keepsCells = false;    // and areas
  bool keepsUnknown = false;  // what nobody knows
};

struct RedactionCounts {
  std::uint64_t identities = 0;  // values of subscriber and device
  std::uint64_t places = 0;
  std::uint64_t unknownValues = 0;    // under names that nobody knows, and which could be identities
  std::uint64_t unknownMessages = 0;  // of log codes that nobody knows
  std::uint64_t unreadable = 0;       // property lists, and what else could not be read
};

class PlistRedactor {
 public:
  // Redacts data that stands under a name, with what it holds; false where it does not know it.
  using Nested = std::function<bool(std::string_view name, Bytes& data)>;

  PlistRedactor(const NameBook& book, const PlistSerialiser& plists, const Replacement& replacement,
                RedactionChoice choice)
      : book_(book), plists_(plists), replacement_(replacement), choice_(choice) {}

  // False when it is none, or when afterwards it is another than was meant; its bytes are then not redacted.
  // `nested` may be empty.
  bool redact(std::span<std::uint8_t> document, RemovedIdentities& removed, RedactionCounts& counts,
              const Nested& nested = {}) const;

 private:
  struct Change {
    PlistPiece piece;  // without its path
    NamedValue value;
  };
  using Changes = std::map<const std::uint8_t*, Change>;

  static bool redactNested(const PlistPiece& piece, const Nested& nested);
  std::optional<NamedValue> toReplace(const PlistPiece& piece, RedactionCounts& counts) const;
  bool isChosen(const NamedValue& value) const;
  void note(const PlistPiece& piece, RedactionCounts& counts, Changes& changes) const;
  void replace(const Change& change, RemovedIdentities& removed) const;
  void replaceText(const Change& change, RemovedIdentities& removed) const;
  void replaceNumber(const Change& change, RemovedIdentities& removed) const;
  void replaceData(const Change& change, RemovedIdentities& removed) const;
  bool isWellRedacted(const PlistValue& before, const PlistValue& after, std::vector<std::string>& path,
                      bool isXml) const;

  const NameBook& book_;
  const PlistSerialiser& plists_;
  const Replacement& replacement_;
  RedactionChoice choice_;
};

}  // namespace kelvasi
