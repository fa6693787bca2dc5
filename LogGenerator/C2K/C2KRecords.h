// The CDMA record parsers, one per log code. Each checks the record's length, and on a failure logs it and
// leaves every row as it was.
#pragma once

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/LogCode.h"

namespace kelvasi {

struct C2KRecord {
  LogCode logCode;
  void (*parse)(const C2KUpdate& update);
};

void parseEvdoStatus(const C2KUpdate& update);        // 0x1183
void parseEvdoActiveSet(const C2KUpdate& update);     // 0x12B6
void parseEvdoForwardRate(const C2KUpdate& update);   // 0x1192
void parseEvdoReverseRate(const C2KUpdate& update);   // 0x127E
void parseFingers(const C2KUpdate& update);           // 0x108A
void parseDeviceStatus(const C2KUpdate& update);      // 0x119C
void parseTrafficFER(const C2KUpdate& update);        // 0x119D
void parseSystemParameters(const C2KUpdate& update);  // 0x134F

}  // namespace kelvasi
