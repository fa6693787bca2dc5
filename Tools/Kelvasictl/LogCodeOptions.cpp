// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LogCodeOptions.h"

#include <charconv>
#include <optional>
#include <string_view>
#include <utility>

namespace kelvasi {

namespace {

constexpr LogCode largestOfBaseband = 0xFFFF;
constexpr LogCode largestOfDaemon = extraLogCodes + 0xFFFF;

std::optional<LogCode> codeIn(std::string_view text) {
  const bool isHex = text.starts_with("0x") || text.starts_with("0X");
  if (isHex) text.remove_prefix(2);
  LogCode code = 0;
  const char* const end = text.data() + text.size();
  const auto [rest, error] = std::from_chars(text.data(), end, code, isHex ? 16 : 10);
  if (error != std::errc() || rest != end) return std::nullopt;
  if (code <= largestOfBaseband || (code >= extraLogCodes && code <= largestOfDaemon)) return code;
  return std::nullopt;
}

using Range = std::pair<LogCode, LogCode>;

// Of the baseband's codes or of the daemon's, not across both.
std::optional<Range> rangeIn(std::string_view text) {
  const std::size_t dash = text.find('-');
  if (dash == std::string_view::npos) return std::nullopt;
  const auto from = codeIn(text.substr(0, dash));
  const auto to = codeIn(text.substr(dash + 1));
  if (!from || !to || *from > *to) return std::nullopt;
  if ((*from < extraLogCodes) != (*to < extraLogCodes)) return std::nullopt;
  return Range{*from, *to};
}

constexpr std::string_view places = "0 to 0xFFFF, or 0xFF0000 to 0xFFFFFF for the daemon's own records";

std::string checkCode(const std::string& text) {
  return codeIn(text) ? "" : "\"" + text + "\" is no log code (" + std::string(places) + ")";
}
std::string checkRange(const std::string& text) {
  return rangeIn(text) ? ""
                       : "\"" + text + "\" is no range of log codes such as 0xB000-0xB1FF (" +
                             std::string(places) + ")";
}

}  // namespace

void LogCodeOptions::addTo(OptionSet verb) {
  verb.add("--code", codes,
           "also ask for this log code, decimal or with 0x; may be given again. From 0xFF0000 on, codes "
           "are those of the daemon's own records")
      .type("N")
      .oneValueEach()
      .check(checkCode);
  verb.add("--all-codes", ranges,
           "also ask for all log codes of a range such as 0xB000-0xB1FF; may be given again")
      .type("FROM-TO")
      .oneValueEach()
      .check(checkRange);
}

std::vector<LogCode> LogCodeOptions::all() const {
  std::vector<LogCode> result;
  for (const std::string& code : codes) result.push_back(codeIn(code).value());
  for (const std::string& range : ranges) {
    const auto [from, to] = rangeIn(range).value();
    for (LogCode code = from; code <= to; ++code) result.push_back(code);
  }
  return result;
}

}  // namespace kelvasi
