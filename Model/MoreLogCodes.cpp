// SPDX-License-Identifier: Apache-2.0
#include "Model/MoreLogCodes.h"

#include <set>
#include <string>
#include <string_view>

namespace kelvasi {

namespace {

constexpr std::string_view basebandCodes = "SetOrvaneLogCodes";
constexpr std::string_view daemonCodes = "SetTelvonExtraCodes";

void add(PlistDictionary& command, std::string_view key, const std::set<LogCode>& logCodes) {
  if (logCodes.empty()) return;
  const auto list = PlistArray::make();
  std::set<LogCode> missing = logCodes;
  if (const PlistArray* asked = command.get(key).array()) {
    for (const PlistValue& code : *asked) {
      list->append(code);
      if (code.integer()) missing.erase(static_cast<LogCode>(*code.integer()));
    }
  }
  for (const LogCode code : missing) list->append(static_cast<std::int64_t>(code));
  command.set(key, list);
}

}  // namespace

PlistValue withLogCodes(PlistValue command, std::span<const LogCode> logCodes) {
  PlistDictionary* lists = command.dictionary();
  if (!lists || (!lists->find(basebandCodes) && !lists->find(daemonCodes))) return command;
  std::set<LogCode> ofBaseband;
  std::set<LogCode> ofDaemon;
  for (const LogCode code : logCodes) {
    if (code < extraLogCodes) {
      ofBaseband.insert(code);
    } else {
      ofDaemon.insert(code - extraLogCodes);
    }
  }
  add(*lists, basebandCodes, ofBaseband);
  add(*lists, daemonCodes, ofDaemon);
  return command;
}

}  // namespace kelvasi
