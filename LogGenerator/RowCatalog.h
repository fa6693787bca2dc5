// SPDX-License-Identifier: Apache-2.0
// Every row that the displays of a technology can have, for those who list them.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "LogGenerator/EntryList.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/Row.h"

namespace kelvasi {

struct CellTable;

// Rows that one part of a record has; none where only its fields are of interest.
struct RecordPart {
  LogCode logCode = 0;
  std::span<const Field> layout = {};  // empty: the rows are calculated, or come from a property list
  std::span<const Row> rows = {};
  std::string_view of = {};            // the fields count from the start of an entry, a sub-packet and so on
  std::string_view list = {};          // the row of the section that holds them as a list
  unsigned digits = 0;                 // each row is so many decimal digits, of which its field is the first
  std::size_t minimumLength = 0;       // of a record that shows these rows
  const EntryList* entries = nullptr;  // `of` is an entry of this list
};

struct CatalogRow {
  std::string section;
  std::string key;  // as the display has it
  LogCode logCode = 0;
  const Row* row = nullptr;
  std::optional<Field> field = {};   // nothing: calculated, or from a property list
  std::string of = {};               // what the field's bytes count from, where that is not the record
  unsigned digits = 0;               // decimal ones, where the field is only the first of them
  std::string list = {};             // the row that holds a list of these
  std::string source = {};           // the key in a property list
  RecordPart part = {};              // where it comes from
  const CellTable* cells = nullptr;  // which of the daemon's cells show it
};

class RowCatalog {
 public:
  // The entries of its list, if any, last as long as the process.
  void add(std::string_view section, const RecordPart& part);
  void addPart(const RecordPart& part) { parts_.push_back(part); }
  void add(CatalogRow row) { rows_.push_back(std::move(row)); }

  std::span<const CatalogRow> rows() const { return rows_; }
  std::vector<CatalogRow>& rows() { return rows_; }
  // All that were added, in order, those without rows among them.
  std::span<const RecordPart> parts() const { return parts_; }

 private:
  std::vector<CatalogRow> rows_;
  std::vector<RecordPart> parts_;
};

}  // namespace kelvasi
