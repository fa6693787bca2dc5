// The pilots of the 1x active set with their Ec/Io.
#pragma once

#include "LogGenerator/RecordView.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// The list of the active-set sub-packet; without pilots it is empty, never "(none)".
PlistValue activeSet1x(RecordView subPacket);

}  // namespace kelvasi
