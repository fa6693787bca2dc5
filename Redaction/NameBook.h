// SPDX-License-Identifier: Apache-2.0
// Says of a value in a property list what it identifies, by the names on the way to it.
#pragma once

#include <map>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "LogGenerator/RowCatalog.h"
#include "Radio/Identifying.h"

namespace kelvasi {

struct NamedValue {
  Identifies identifies = Identifies::nothing;
  std::string_view kind = {};  // pseudonyms of one kind are the same everywhere
};

// Small letters and digits of a name, and nothing else of it.
std::string plainName(std::string_view name);

class NameBook {
 public:
  void learn(const RowCatalog& catalog);

  // Nothing when no name on the way is known.
  std::optional<NamedValue> of(std::span<const std::string> path) const;

 private:
  struct Known {
    std::string section;  // empty: any
    NamedValue value;
  };

  const NamedValue* learned(std::span<const std::string> path) const;

  std::multimap<std::string, Known, std::less<>> rows_;  // by key, and by key in a property list
};

// Whether a text that nobody knows could name somebody: it has a long number, an address or an
// "@" in it.
bool couldIdentify(std::string_view text);

}  // namespace kelvasi
