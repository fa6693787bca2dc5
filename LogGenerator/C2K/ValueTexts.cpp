#include "LogGenerator/C2K/ValueTexts.h"

#include <array>
#include <cmath>
#include <span>

namespace kelvasi {

namespace {

// The text of entry 9 lacks a blank.
constexpr std::array bandClasses{
    "800 MHz cellular band [0]",
    "1.8 to 2.0GHz PCS band [1]",
    "872 to 960MHz TACS band [2]",
    "832 to 925MHz JTACS band [3]",
    "1.75 to 1.87GHz Korean PCS band [4]",
    "450MHz band [5]",
    "2GHz band [6]",
    "700MHz band [7]",
    "1800 MHz band [8]",
    "900 MHzband [9]",
    "Secondary 800 MHz band [10]",
    "400 MHz European PAMR band [11]",
    "800 MHz European PAMR band [12]",
};
constexpr std::array evdoDeviceStates{"Inactive [0]", "Acquisition [1]", "Sync [2]",
                                      "Idle [3]",     "Access [4]",      "Connected [5]"};
constexpr std::array evdoSessionStates{"Closed [0]", "AMP setup [1]", "AT-initiated neg [2]",
                                       "Initiated neg [3]", "Open [4]"};
constexpr std::array deviceStates{
    "Inactive [0]",
    "Deep sleep in start state [1]",
    "Initial state for CDMA operation [2]",
    "Acquisition [3]",
    "Sync [4]",
    "Slew [5]",
    "Paging [6]",
    "Slotted mode sleep state [7]",
    "Traffic [8]",
    "UnSlew [9]",
    "Operation in PCG state [10]",
    "Powerup state [11]",
};
constexpr std::array roamingIndicators{
    "OFF [0]",
    "ON [1]",
    "Flashing [2]",
    "Out of Neighborhood [3]",
    "Out of Building [4]",
    "Preferred system [5]",
    "Available system [6]",
    "Alliance partner [7]",
    "Premium partner [8]",
    "Full service functionality [9]",
    "Partial service functionality [10]",
    "Banner ON [11]",
    "Banner OFF [12]",
};

bool isIn(std::span<const char* const> texts, std::int64_t value) {
  return value >= 0 && static_cast<std::uint64_t>(value) < texts.size();
}

// The fallback is a format for the value itself.
FormattedText textOr(std::span<const char* const> texts, std::int64_t value, const char* fallback)
    __attribute__((format(printf, 3, 0)));
FormattedText textOr(std::span<const char* const> texts, std::int64_t value, const char* fallback) {
  if (isIn(texts, value)) return FormattedText("%s", texts[static_cast<std::size_t>(value)]);
  return FormattedText(fallback, static_cast<int>(value));
}

constexpr const char* badValue = "[Bad Value %d]";
constexpr const char* reserved = "[Reserved %d]";

}  // namespace

FormattedText decimalText(std::int64_t value) {
  return FormattedText("%d", static_cast<int>(value));
}

FormattedText bandClassText(std::int64_t value) {
  return textOr(bandClasses, value, badValue);
}

FormattedText evdoDeviceStateText(std::int64_t value) {
  return textOr(evdoDeviceStates, value, reserved);
}

FormattedText evdoSessionStateText(std::int64_t value) {
  return textOr(evdoSessionStates, value, reserved);
}

FormattedText deviceStateText(std::int64_t value) {
  return textOr(deviceStates, value, badValue);
}

FormattedText roamingIndicatorText(std::int64_t value) {
  return textOr(roamingIndicators, value, "ERI - %d");
}

FormattedText strengthText(std::int64_t value) {
  return FormattedText("%+.2f dB", 10 * std::log10(static_cast<double>(value) / 512));
}

}  // namespace kelvasi
