// SPDX-License-Identifier: Apache-2.0
// What a measurement is compared with, on the same messages.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "Bench/LogGenerator/Samples.h"
#include "Bench/Support/Table.h"
#include "Plist/PlistValue.h"

namespace kelvasi::bench {

// memcpy of one message an iteration.
Work copying(Messages messages);

// The rows of a display, as a plain program would show them once it knows their values.
class PlainRows {
 public:
  // Every text of the display, its path as its key.
  explicit PlainRows(const PlistValue& display);

  std::size_t size() const { return rows_.size(); }
  std::size_t bytes() const;
  void show(std::map<std::string, std::string>& texts) const;

 private:
  struct Row {
    std::string key;
    enum class Kind { text, whole, measured } kind;
    long whole;
    double measured;
    std::string rest;  // the text, or what follows the number
  };

  void collect(const std::string& path, const PlistValue& value);
  static Row rowOf(std::string key, const std::string& text);

  std::vector<Row> rows_;
};

// Shows one of these displays an iteration, in turn. They are made when the measurement runs.
Work showing(std::function<std::vector<PlainRows>()> makeDisplays);

}  // namespace kelvasi::bench
