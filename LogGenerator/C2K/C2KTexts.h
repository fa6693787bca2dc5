// Texts of the values that several records show.
#pragma once

#include <cstdint>

#include "LogGenerator/C2K/C2KText.h"

namespace kelvasi {

C2KText decimalText(std::int64_t value);
C2KText bandClassText(std::int64_t value);  // 3GPP2 C.S0057
C2KText evdoDeviceStateText(std::int64_t value);
C2KText evdoSessionStateText(std::int64_t value);
C2KText deviceStateText(std::int64_t value);
C2KText roamingIndicatorText(std::int64_t value);  // 3GPP2 C.R1001
// A strength in 1/512 units as dB; nothing to speak of at 0, which shows as minus infinity.
C2KText strengthText(std::int64_t value);

}  // namespace kelvasi
