// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/CellFields.h"

#include <algorithm>

namespace kelvasi {

CellIdentity cellOf(const CellFields& fields, RecordView record, RecordView entry) {
  // A number below 0 names nothing.
  const auto part = [](RecordView view, const std::optional<Field>& field) {
    return field ? std::max(valueOf(view, *field), CellIdentity::unknown) : CellIdentity::unknown;
  };
  return {.family = fields.family,
          .channel = fields.headChannel ? part(record, fields.headChannel) : part(entry, fields.channel),
          .code = part(entry, fields.code)};
}

CellIdentity servingCellOf(const CellFields& fields, RecordView record, LogCode logCode,
                           ServingCells& cells) {
  CellIdentity cell = cellOf(fields, record, record);
  const bool saysOne = fields.channel || fields.code || fields.cellId;
  if (!fields.isServing) return saysOne ? cell : CellIdentity{};
  if (saysOne) {
    const auto cellId = fields.cellId ? std::optional(valueOf(record, *fields.cellId)) : std::nullopt;
    cells.say(logCode, {.cell = cell, .cellId = cellId});
  }
  if (cell.isWhole()) return cell;
  for (std::size_t place = 0; fields.others && place < countOf(record, *fields.others); ++place) {
    const RecordView other = entryOf(record, *fields.others, place);
    cells.deny({.family = fields.family, .channel = valueOf(other, *fields.otherChannel)});
  }
  const CellIdentity certain = cells.certain(fields.family);
  return certain || !saysOne ? certain : cell;
}

}  // namespace kelvasi
