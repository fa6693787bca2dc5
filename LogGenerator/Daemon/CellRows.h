// SPDX-License-Identifier: Apache-2.0
// Rows of cells from the telephony daemon's cell list.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "LogGenerator/RecordView.h"
#include "LogGenerator/RowCatalog.h"
#include "LogGenerator/RowWriter.h"
#include "Platform/Platform.h"
#include "Plist/PlistValue.h"
#include "Telvon/CellInfoArray.h"

namespace kelvasi {

// A number of 32 bits with sign.
struct CellRow {
  Row row;
  std::string_view cellKey;
  std::string_view failure;  // the system-log line, if any, for a cell that lacks the number; no row then
};
// Stands for a measurement that there is not, and shows an empty text.
inline constexpr std::int32_t notMeasured = 32767;
inline constexpr ValueText emptyIfNotMeasured{notMeasured, ""};

// Which numbers of a cell say which cell it is; empty keys for those that none says.
struct CellKeys {
  RadioFamily family = RadioFamily::none;
  std::string_view channel = {};
  std::string_view code = {};
};

// Which cells a section shows, and how.
struct CellTable {
  std::span<const std::string_view> technologies;  // any of these
  std::string_view type;
  std::span<const CellRow> rows;
  CellKeys keys = {};

  bool takes(const PlistValue& cell) const;
  void describe(std::string_view section, RowCatalog& catalog) const;
  // Which cell it is, and what the network calls it.
  ServingCells::Word identityOf(const PlistDictionary& cell) const;
};

// Keeps in mind which cell serves, where anybody listens.
void showCell(const PlistDictionary& cell, const CellTable& table, RowWriter& writer, SystemLog& log);

// The record's cell list. Null when it has none; a payload that is no property list is worth a line in the
// system log, one of another kind is not.
const PlistArray* cellsOf(const CellInfoArray& cellInfo, SystemLog& log);

// The rows of the first cell that the table takes; nothing changes when there is none. Whether there is a
// list.
bool showFirstCell(const Platform& platform, RecordView record, const CellTable& table,
                   PlistDictionary& section, const ReadingPlace& place);

}  // namespace kelvasi
