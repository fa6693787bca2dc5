// Texts of the values that several records show.
#pragma once

#include <cstdint>

#include "LogGenerator/C2K/FormattedText.h"

namespace kelvasi {

FormattedText decimalText(std::int64_t value);
FormattedText bandClassText(std::int64_t value);  // 3GPP2 C.S0057
FormattedText evdoDeviceStateText(std::int64_t value);
FormattedText evdoSessionStateText(std::int64_t value);
FormattedText deviceStateText(std::int64_t value);
FormattedText roamingIndicatorText(std::int64_t value);  // 3GPP2 C.R1001
// A strength in 1/512 units as dB; nothing to speak of at 0, which shows as minus infinity.
FormattedText strengthText(std::int64_t value);

}  // namespace kelvasi
