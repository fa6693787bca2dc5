// SPDX-License-Identifier: Apache-2.0
// The CDMA record parsers, one per log code. Each checks the record's length, and on a failure logs it and
// leaves every row as it was.
#pragma once

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/Intake.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

struct C2KRecord {
  LogCode logCode;
  Outcome (*parse)(const C2KUpdate& update);
  std::span<const RecordPart> (*parts)();     // what it shows; the keys of the rows are lookup names
  std::optional<std::size_t> versionAt = {};  // the byte that says the record's version
};

std::span<const RecordPart> evdoStatusParts();
std::span<const RecordPart> evdoActiveSetParts();
std::span<const RecordPart> evdoForwardRateParts();
std::span<const RecordPart> evdoReverseRateParts();
std::span<const RecordPart> fingersParts();
std::span<const RecordPart> deviceStatusParts();
std::span<const RecordPart> trafficFERParts();
std::span<const RecordPart> systemParametersParts();

Outcome parseEvdoStatus(const C2KUpdate& update);        // 0x1183
Outcome parseEvdoActiveSet(const C2KUpdate& update);     // 0x12B6
Outcome parseEvdoForwardRate(const C2KUpdate& update);   // 0x1192
Outcome parseEvdoReverseRate(const C2KUpdate& update);   // 0x127E
Outcome parseFingers(const C2KUpdate& update);           // 0x108A
Outcome parseDeviceStatus(const C2KUpdate& update);      // 0x119C
Outcome parseTrafficFER(const C2KUpdate& update);        // 0x119D
Outcome parseSystemParameters(const C2KUpdate& update);  // 0x134F

}  // namespace kelvasi
