// SPDX-License-Identifier: Apache-2.0
// How figures and tables are written.
#pragma once

#include <string>
#include <vector>

namespace kelvasi::bench {

std::string fixed(double value, int decimals);
// Rounded, with a comma between thousands.
std::string grouped(double value);
// In the unit that suits it: "312 ns", "4.12 ms".
std::string duration(double seconds);
// Three digits that count: "0.0123", "1.87", "24.6".
std::string ratio(double value);

// Lines of cells in columns, the first left-aligned and the others right-aligned, a rule below the first
// line.
std::string aligned(const std::vector<std::vector<std::string>>& lines);

}  // namespace kelvasi::bench
