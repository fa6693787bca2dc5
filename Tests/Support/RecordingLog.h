// SPDX-License-Identifier: Apache-2.0
// A system log and a trace output that remember what was written.
#pragma once

#include <string>
#include <vector>

#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"

namespace kelvasi::test {

class RecordingLog : public SystemLog {
 public:
  bool wants(LogPriority priority) const override { return !isMasked || priority == LogPriority::error; }
  void write(LogPriority priority, std::string_view text) override {
    lines_.push_back({priority, std::string(text)});
  }

  // Texts of one priority, in order; addresses ("0x" and six digits or more, and "(nil)") are replaced by
  // "<ptr>".
  std::vector<std::string> lines(LogPriority priority) const;
  std::vector<std::string> errors() const { return lines(LogPriority::error); }
  std::vector<std::string> warnings() const { return lines(LogPriority::warning); }
  // Whatever its priority; empty when nothing was written.
  std::string firstLine() const { return lines_.empty() ? std::string() : lines_.front().text; }
  void clear() { lines_.clear(); }

  bool isMasked = false;  // then only errors are wanted

 private:
  struct Line {
    LogPriority priority;
    std::string text;
  };
  std::vector<Line> lines_;
};

class RecordingTrace : public TraceOutput {
 public:
  void writeLine(std::string_view text) override { lines.emplace_back(text); }
  std::vector<std::string> lines;
};

}  // namespace kelvasi::test
