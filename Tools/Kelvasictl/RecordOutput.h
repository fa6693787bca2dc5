// SPDX-License-Identifier: Apache-2.0
// Records for the standard output: a table for people, NDJSON or CSV for programs. Each record is printed as
// it comes and none is kept.
#pragma once

#include <functional>
#include <nlohmann/json.hpp>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "Tools/OptionSet.h"

namespace kelvasi {

using Json = nlohmann::ordered_json;

struct Column {
  std::string_view key;   // of the record's member
  std::size_t width = 0;  // in a table; 0: not shown there
  bool isNumber = false;  // stands at the right of its column
  int decimals = 0;       // in a table
  bool isTime = false;    // whole seconds are enough for a table
};

// The columns of a table, as wide as these records need at least.
std::vector<Column> fitted(std::span<const Column> columns, std::span<const Json> records);

class RecordOutput {
 public:
  enum class Format { table, ndjson, csv };
  using Print = std::function<void(std::string_view text)>;

  // The columns outlast the output.
  RecordOutput(Format format, std::span<const Column> columns, Print print)
      : format_(format), columns_(columns), print_(std::move(print)) {}

  // The heading of a table or of CSV, before the first record.
  void begin();
  // An object with the columns' keys. NDJSON prints it as it is.
  void print(const Json& record);

 private:
  std::string tableLine(const Json& record) const;

  Format format_;
  std::span<const Column> columns_;
  Print print_;
};

struct FormatOption {
  std::string name;

  void addTo(OptionSet verb);
  // Unless one was named, a table on a terminal and NDJSON elsewhere.
  RecordOutput::Format format() const;
};

}  // namespace kelvasi
