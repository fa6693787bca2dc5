// SPDX-License-Identifier: Apache-2.0
// Prints the readings of messages, as far as they are wanted.
#pragma once

#include <functional>
#include <string>
#include <string_view>

#include "Tools/Kelvasictl/ReadingChanges.h"
#include "Tools/Kelvasictl/ReadingChoice.h"
#include "Tools/Kelvasictl/ReadingLines.h"

namespace kelvasi {

struct ReadingWish {
  ReadingChoice choice;
  std::string format = "ndjson";  // or "csv"
  bool onlyChanges = false;

  void addTo(OptionSet verb);
  ReadingLines lines() const {
    return ReadingLines(format == "csv" ? ReadingLines::Format::csv : ReadingLines::Format::ndjson);
  }
};

class ReadingPrinter {
 public:
  using Print = std::function<void(std::string_view text)>;

  // `wish` outlives it.
  ReadingPrinter(const ReadingWish& wish, Print print);

  // What follows is of this technology, an identifier.
  void setTechnology(std::string_view technology);
  // The readings of a message. They are printed together with others, when there are many of them.
  void take(const Readings& message);
  // Prints what waits.
  void flush();

 private:
  void takeOne(const Reading& reading);
  void takeChanges(const Readings& message);

  const ReadingWish& wish_;
  Print print_;
  ReadingLines lines_;
  ReadingChanges changes_;
  std::string technology_;  // its short name
  std::string path_;
  std::string waiting_;
};

}  // namespace kelvasi
