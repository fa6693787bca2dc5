// SPDX-License-Identifier: Apache-2.0
// Which fields of a record, or of an entry of its list, say which cell it is about.
#pragma once

#include <optional>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/Readings.h"
#include "LogGenerator/RecordLayout.h"

namespace kelvasi {

struct CellFields {
  RadioFamily family = RadioFamily::none;  // none: not about a cell
  std::optional<Field> channel = {};
  std::optional<Field> code = {};
  std::optional<Field> headChannel = {};  // in the record that the list is in, where entries have none
  std::optional<Field> cellId = {};       // of a serving cell
  // The cell serves. What the record leaves open the other records may add; one that says nothing of the cell
  // is about the serving cell where that is certain.
  bool isServing = false;
  // A list in the record of cells, by their channels, none of which serves.
  std::optional<EntryList> others = {};
  std::optional<Field> otherChannel = {};
  bool takesServingChannel = false;  // entries without a channel, where the serving cell is among them
};

// Of a record, or of an entry of a list in `record`.
CellIdentity cellOf(const CellFields& fields, RecordView record, RecordView entry);
// The cell of a record of this code without a list; what it says of the serving cell is kept in mind.
CellIdentity servingCellOf(const CellFields& fields, RecordView record, LogCode logCode, ServingCells& cells);

}  // namespace kelvasi
