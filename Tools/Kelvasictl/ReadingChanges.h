// SPDX-License-Identifier: Apache-2.0
// Of readings only those that change what is shown.
//
// A list is written anew by every message that has it. As long as its entries have the same rows, only rows
// that differ count as changes; else the whole of it does.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "LogGenerator/Readings.h"

namespace kelvasi {

// A reading with what is made of it.
struct ReadingText {
  const Reading* reading = nullptr;
  std::string path;
  std::optional<std::string> text;  // nothing: removed
};

class ReadingChanges {
 public:
  // Of one message's readings, those that changed something, in their order.
  std::vector<ReadingText> of(std::vector<ReadingText> message);

 private:
  struct Shown {
    std::string path;
    std::string text;
    const Quantity* quantity = nullptr;
    bool operator==(const Shown&) const = default;
  };

  bool isChange(const ReadingText& row);
  // `places`: of the list's readings in the message.
  static void markList(std::vector<Shown>& standing, const std::vector<ReadingText>& message,
                       const std::vector<std::size_t>& places, std::vector<bool>& changes);

  std::unordered_map<std::string, Shown> rows_;                // outside lists, by path
  std::unordered_map<std::string, std::vector<Shown>> lists_;  // as written last, by the list's path
};

}  // namespace kelvasi
