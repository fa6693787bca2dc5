// SPDX-License-Identifier: Apache-2.0
// The names by which the CDMA records address the display, each once.
#pragma once

#include <algorithm>
#include <string_view>
#include <vector>

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi::test {

inline std::vector<std::string_view> c2kLookupNames() {
  std::vector<std::string_view> names;
  for (const C2KRecord& record : c2kRecords()) {
    for (const RecordPart& part : record.parts()) {
      for (const Row& row : part.rows) {
        if (std::ranges::count(names, row.key) == 0) names.push_back(row.key);
      }
    }
  }
  return names;
}

}  // namespace kelvasi::test
