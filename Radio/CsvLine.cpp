// SPDX-License-Identifier: Apache-2.0
#include "Radio/CsvLine.h"

#include <cstddef>

namespace kelvasi {

namespace {

// Takes a field off the front of the line, up to the comma after it.
std::string takePlain(std::string_view& line) {
  const std::string_view field = line.substr(0, line.find(','));
  line.remove_prefix(field.size());
  return std::string(field);
}

std::optional<std::string> takeQuoted(std::string_view& line) {
  std::string field;
  for (std::size_t at = 1; at < line.size(); ++at) {
    if (line[at] == '"') {
      const bool isDoubled = at + 1 < line.size() && line[at + 1] == '"';
      if (!isDoubled) {
        line.remove_prefix(at + 1);
        return field;
      }
      ++at;
    }
    field += line[at];
  }
  return std::nullopt;
}

}  // namespace

std::optional<std::vector<std::string>> csvFields(std::string_view line) {
  std::vector<std::string> fields;
  while (true) {
    const auto field = line.starts_with('"') ? takeQuoted(line) : takePlain(line);
    if (!field) return std::nullopt;
    fields.push_back(*field);
    if (line.empty()) return fields;
    if (line.front() != ',') return std::nullopt;
    line.remove_prefix(1);
  }
}

}  // namespace kelvasi
