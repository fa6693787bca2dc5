// SPDX-License-Identifier: Apache-2.0
// Moments and durations for people, in UTC.
#pragma once

#include <string>

namespace kelvasi::report {

std::string dateAndTime(double secondsSince1970);  // "2024-03-05 14:07:09"
std::string timeOfDay(double secondsSince1970);    // "14:07:09"
std::string duration(double seconds);              // "1 h 02 min 09 s"

}  // namespace kelvasi::report
