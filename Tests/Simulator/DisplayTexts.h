// SPDX-License-Identifier: Apache-2.0
// Every text of a display, with the way to it.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "Plist/PlistValue.h"

namespace kelvasi::sim::test {

using PathAndText = std::pair<std::string, std::string>;

inline void collectTexts(const PlistValue& value, const std::string& path, std::vector<PathAndText>& texts) {
  if (value.string()) texts.emplace_back(path, *value.string());
  if (value.array()) {
    for (const PlistValue& entry : *value.array()) collectTexts(entry, path + "/", texts);
  }
  if (!value.dictionary()) return;
  for (const auto& [key, entry] : *value.dictionary()) collectTexts(entry, path + "/" + key, texts);
}

inline std::vector<PathAndText> textsOf(const PlistValue& display) {
  std::vector<PathAndText> texts;
  collectTexts(display, "", texts);
  return texts;
}

}  // namespace kelvasi::sim::test
