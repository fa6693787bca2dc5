// SPDX-License-Identifier: Apache-2.0
// A decoder of a dictionary section whose records are rows by tables. For a record with a twist of its own a
// decoder overrides decodeOther, and keeps to the tables for the rest.
#pragma once

#include <span>
#include <string_view>
#include <vector>

#include "LogGenerator/Base.h"
#include "LogGenerator/CellFields.h"
#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/ListRow.h"
#include "LogGenerator/Row.h"

namespace kelvasi {

struct RecordRows {
  LogCode logCode = 0;
  std::size_t minimumLength = 0;  // a shorter record is ignored
  std::span<const Field> layout;
  std::span<const Row> rows;
  CellFields cell = {};
  std::span<const ListColumn> lists = {};  // after the rows
};

struct StateSection {
  std::string_view name;
  std::string_view trace;  // written to the system log at every update
  std::span<const LogCode> logCodes;
  std::span<const RecordRows> records = {};
  const CellTable* cells = nullptr;  // the first such cell of the cell-information record is shown
  CellRole role = CellRole::none;
  bool isSilent = false;                    // no line in the system log for a record that no table describes
  std::span<const RecordPart> others = {};  // of records that these tables do not describe
};

class StateDecoder : public Base {
 public:
  // `section` outlives the decoder.
  StateDecoder(const Platform& platform, const StateSection& section);

  Outcome updateWithData(RecordView record, LogCode logCode) override;
  std::optional<std::size_t> versionAt(LogCode logCode) const override;
  CellRole role() const override { return section_.role; }
  void describe(RowCatalog& catalog) const override;
  std::string_view getSectionName() const override { return section_.name; }
  SectionKind sectionKind() const override { return SectionKind::dictionary; }
  std::span<const LogCode> getLogCodeArray() const override { return section_.logCodes; }

 protected:
  // A record that no table describes; unless overridden, the unknown-message line, or none.
  virtual Outcome decodeOther(RecordView record, LogCode logCode);

 private:
  Outcome showRows(RecordView record, const RecordRows& rows);
  void showLists(RecordView record, const RecordRows& rows);
  Outcome showCell(RecordView record);

  const StateSection& section_;
  std::vector<ListRow> lists_;  // of the first record's columns, then of the next one's
};

// A decoder that is a table and nothing else.
template <const StateSection& section>
class StateTable : public StateDecoder {
 public:
  explicit StateTable(const Platform& platform) : StateDecoder(platform, section) {}
};

}  // namespace kelvasi
