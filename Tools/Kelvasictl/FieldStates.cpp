// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/FieldStates.h"

namespace kelvasi {

std::vector<FieldState> statesOf(const Row& row) {
  std::vector<FieldState> states;
  if (!row.reason.empty()) return states;
  for (std::size_t value = 0; value < row.texts.size(); ++value) {
    if (row.texts[value] != row.otherwise)
      states.push_back({static_cast<std::int64_t>(value), std::string(row.texts[value])});
  }
  if (row.special) states.push_back({row.special->value, std::string(row.special->text)});
  return states;
}

}  // namespace kelvasi
