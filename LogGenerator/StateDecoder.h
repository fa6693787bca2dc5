// SPDX-License-Identifier: Apache-2.0
// A decoder of a dictionary section whose records are rows by tables. For a record with a twist of its own a
// decoder overrides decodeOther, and keeps to the tables for the rest.
#pragma once

#include <span>
#include <string_view>

#include "LogGenerator/Base.h"
#include "LogGenerator/CellFields.h"
#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/Row.h"

namespace kelvasi {

struct RecordRows {
  LogCode logCode = 0;
  std::size_t minimumLength = 0;  // a shorter record is ignored
  std::span<const Field> layout;
  std::span<const Row> rows;
  CellFields cell = {};
};

struct StateSection {
  std::string_view name;
  std::string_view trace;  // written to the system log at every update
  std::span<const LogCode> logCodes;
  std::span<const RecordRows> records = {};
  const CellTable* cells = nullptr;  // the first such cell of the cell-information record is shown
  CellRole role = CellRole::none;
};

class StateDecoder : public Base {
 public:
  // `section` outlives the decoder.
  StateDecoder(const Platform& platform, const StateSection& section) : Base(platform), section_(section) {}

  Outcome updateWithData(RecordView record, LogCode logCode) override;
  std::optional<std::size_t> versionAt(LogCode logCode) const override;
  CellRole role() const override { return section_.role; }
  std::string_view getSectionName() const override { return section_.name; }
  std::span<const LogCode> getLogCodeArray() const override { return section_.logCodes; }

 protected:
  // A record that no table describes; unless overridden, the unknown-message line.
  virtual Outcome decodeOther(RecordView record, LogCode logCode);

 private:
  Outcome showRows(RecordView record, const RecordRows& rows);
  Outcome showCell(RecordView record);

  const StateSection& section_;
};

}  // namespace kelvasi
