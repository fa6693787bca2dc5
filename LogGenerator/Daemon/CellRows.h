// Rows of cells from the telephony daemon's cell list.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "LogGenerator/RecordView.h"
#include "LogGenerator/RowWriter.h"
#include "Platform/Platform.h"
#include "Plist/PlistValue.h"
#include "Telvon/CellInfoArray.h"

namespace kelvasi {

// A number of 32 bits with sign, times the factor.
struct CellRow {
  std::string_view key;
  std::string_view cellKey;
  std::string_view failure;    // the system-log line, if any, for a cell that lacks the number; no row then
  std::string_view unit = {};  // right after the number, its blank included
  bool isMeasurement = false;  // then notMeasured shows an empty text
  std::int32_t factor = 1;
};

inline constexpr std::int32_t notMeasured = 32767;

// Which cells a section shows, and how.
struct CellTable {
  std::span<const std::string_view> technologies;  // any of these
  std::string_view type;
  std::span<const CellRow> rows;

  bool takes(const PlistValue& cell) const;
};

void showCell(const PlistDictionary& cell, std::span<const CellRow> rows, RowWriter& writer, SystemLog& log);

// The record's cell list. Null when it has none; a payload that is no property list is worth a line in the
// system log, one of another kind is not.
const PlistArray* cellsOf(const CellInfoArray& cellInfo, SystemLog& log);

// The rows of the first cell that the table takes; nothing changes when there is none.
void showFirstCell(const Platform& platform, RecordView record, const CellTable& table,
                   PlistDictionary& section);

}  // namespace kelvasi
