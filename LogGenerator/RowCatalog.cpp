// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

void RowCatalog::add(std::string_view section, const RecordPart& part) {
  addPart(part);
  for (const Row& row : part.rows) {
    CatalogRow& added = rows_.emplace_back();
    added.section = section;
    added.key = row.key;
    added.logCode = part.logCode;
    added.row = &row;
    if (!part.layout.empty()) added.field = part.layout[row.field];
    added.digits = part.digits;
    added.of = part.of;
    added.list = part.list;
    added.part = part;
  }
}

}  // namespace kelvasi
