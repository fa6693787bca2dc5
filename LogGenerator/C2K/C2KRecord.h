// SPDX-License-Identifier: Apache-2.0
// What a CDMA record is to the generator: its code, its parser and the rows that it shows.
#pragma once

#include <cstddef>
#include <optional>
#include <span>

#include "LogGenerator/Intake.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi {

struct C2KUpdate;
struct RecordPart;

struct C2KRecord {
  LogCode logCode;
  std::size_t minimumLength;  // of a whole record
  // Checks the record's length, and on a failure logs it and leaves every row as it was.
  Outcome (*parse)(const C2KUpdate& update);
  // What it shows; the keys of the rows are lookup names.
  std::span<const RecordPart> (*parts)();
  std::optional<std::size_t> versionAt = {};  // the byte that says the record's version
};

}  // namespace kelvasi
