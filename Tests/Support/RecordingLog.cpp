// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/RecordingLog.h"

#include <regex>

namespace kelvasi::test {

std::vector<std::string> RecordingLog::lines(LogPriority priority) const {
  static const std::regex address(R"(0x[0-9a-f]{6,}|\(nil\))");
  std::vector<std::string> texts;
  for (const Line& line : lines_) {
    if (line.priority == priority) texts.push_back(std::regex_replace(line.text, address, "<ptr>"));
  }
  return texts;
}

}  // namespace kelvasi::test
