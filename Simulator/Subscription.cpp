// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Subscription.h"

#include <array>
#include <string_view>

namespace kelvasi::sim {

namespace {

struct CodeList {
  std::string_view key;
  LogCode base;
};
constexpr std::array codeLists{CodeList{"SetOrvaneLogCodes", 0},
                               CodeList{"SetTelvonExtraCodes", extraLogCodes}};
constexpr std::int64_t largestCode = 0xFFFF;

}  // namespace

Subscription Subscription::fromStartCommand(const PlistDictionary& command) {
  Subscription subscription;
  subscription.everything_ = true;
  for (const CodeList& list : codeLists) {
    const PlistValue codes = command.get(list.key);
    if (!codes.array()) continue;
    subscription.everything_ = false;
    for (const PlistValue& code : *codes.array()) {
      const std::int64_t* number = code.integer();
      if (number && *number >= 0 && *number <= largestCode)
        subscription.codes_.insert(list.base + static_cast<LogCode>(*number));
    }
  }
  return subscription;
}

}  // namespace kelvasi::sim
