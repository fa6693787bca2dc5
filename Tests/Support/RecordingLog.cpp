// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/RecordingLog.h"

#include <algorithm>
#include <string_view>

namespace kelvasi::test {

namespace {

constexpr std::string_view nil = "(nil)";
constexpr std::size_t fewestDigits = 6;

// How long the address at the beginning is; 0 for none.
std::size_t lengthOfAddress(std::string_view text) {
  if (text.starts_with(nil)) return nil.size();
  if (!text.starts_with("0x")) return 0;
  const std::size_t end = std::min(text.find_first_not_of("0123456789abcdef", 2), text.size());
  return end - 2 < fewestDigits ? 0 : end;
}

std::string withoutAddresses(std::string_view text) {
  std::string result;
  while (!text.empty()) {
    const std::size_t length = lengthOfAddress(text);
    result += length > 0 ? "<ptr>" : text.substr(0, 1);
    text.remove_prefix(std::max<std::size_t>(length, 1));
  }
  return result;
}

}  // namespace

std::vector<std::string> RecordingLog::lines(LogPriority priority) const {
  std::vector<std::string> texts;
  for (const Line& line : lines_) {
    if (line.priority == priority) texts.push_back(withoutAddresses(line.text));
  }
  return texts;
}

}  // namespace kelvasi::test
