// SPDX-License-Identifier: Apache-2.0
// The keys of a dictionary that is shown sorted: "01;Serving Cell" is shown as "Serving Cell".
#pragma once

#include <string_view>

namespace kelvasi {

// Its key marks such a dictionary.
inline constexpr std::string_view sortedMark = "_sorted";

// Without the sort prefix, when the key is a prefix, one ";" and a name.
constexpr std::string_view withoutSortPrefix(std::string_view key) {
  const std::size_t separator = key.find(';');
  const bool isPrefixed =
      separator != std::string_view::npos && key.find(';', separator + 1) == std::string_view::npos;
  return isPrefixed ? key.substr(separator + 1) : key;
}

}  // namespace kelvasi
