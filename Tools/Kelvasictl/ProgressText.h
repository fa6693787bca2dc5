// SPDX-License-Identifier: Apache-2.0
// How far the reading of captures has come, in one line for people.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace kelvasi {

struct ProgressFigures {
  std::uint64_t messages = 0;
  std::uint64_t bytes = 0;                    // of the files
  std::optional<std::uint64_t> bytesInAll{};  // nothing where nobody knows, as in a pipe
  double seconds = 0;                         // since the beginning
};

// "[#####     ] 50 %, 0:03 left, 1,560,000 messages, 63.9 of 127.9 MB, 520,000/s", and without what nobody
// knows. At most so many columns.
std::string progressText(const ProgressFigures& figures, std::size_t columns);

}  // namespace kelvasi
