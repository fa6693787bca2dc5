// SPDX-License-Identifier: Apache-2.0
// Decimal texts of measurements without the cost of printf.
#pragma once

namespace kelvasi {

// The format that writeHundredths writes.
inline constexpr char hundredths[] = "%4.2f";

// Writes `value` as printf writes it with `hundredths`: rounded to two decimals, a tie to the even digit.
// Returns the end of the text, at most 16 characters after `to`, with no NUL. Null, and nothing is written,
// for a value that is no whole number of eighths or reaches 2^32.
char* writeHundredths(char* to, double value);

}  // namespace kelvasi
