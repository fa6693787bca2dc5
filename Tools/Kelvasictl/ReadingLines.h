// SPDX-License-Identifier: Apache-2.0
// Readings as lines of NDJSON or CSV (Docs/readings.md).
#pragma once

#include <string>
#include <string_view>

#include "LogGenerator/Readings.h"

namespace kelvasi {

// The columns, in order, of both formats.
inline constexpr std::array<std::string_view, 11> readingColumns{
    "time", "technology", "code", "path", "section", "row", "cell", "text", "value", "unit", "quantity"};

class ReadingLines {
 public:
  enum class Format { ndjson, csv };

  explicit ReadingLines(Format format) : format_(format) {}

  // What CSV begins with; nothing in NDJSON.
  std::string heading() const;
  // What follows is of this message. `technology` is its short name.
  void startMessage(const Readings& message, std::string_view technology);
  // With its line feed. `path` and `text` are the reading's.
  void append(std::string& to, const Reading& reading, std::string_view path,
              const std::optional<std::string>& text) const;

 private:
  void appendJson(std::string& to, const Reading& reading, std::string_view path,
                  const std::optional<std::string>& text) const;
  void appendCsv(std::string& to, const Reading& reading, std::string_view path,
                 const std::optional<std::string>& text) const;

  Format format_;
  std::string beginning_;  // of each line of the message
};

}  // namespace kelvasi
