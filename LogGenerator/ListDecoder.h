// SPDX-License-Identifier: Apache-2.0
// A decoder of an array section: one dictionary for each entry of a record's list, and, where it asks for
// the cell list, one for each cell that its table takes. A record with a twist of its own overrides addEntry.
#pragma once

#include <span>
#include <string_view>

#include "LogGenerator/Base.h"
#include "LogGenerator/CellFields.h"
#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/EntryList.h"
#include "LogGenerator/Row.h"
#include "LogGenerator/RowList.h"

namespace kelvasi {

struct ListSection {
  std::string_view name;
  std::string_view trace;  // written to the system log at every update
  LogPriority tracePriority = LogPriority::warning;
  std::span<const LogCode> logCodes;
  LogCode logCode = 0;            // of the record with the list
  std::size_t minimumLength = 0;  // a shorter record is ignored
  EntryList list;
  std::span<const Row> rows = {};    // of an entry
  bool staysEmpty = false;           // the entries are read and not shown
  const CellTable* cells = nullptr;  // for the cell-information record
  CellRole role = CellRole::none;
  CellFields cell = {};   // of an entry
  bool isSilent = false;  // no line in the system log for a record that neither table describes
  std::span<const RecordPart> others = {};  // of an entry, beside `rows`
};

class ListDecoder : public Base {
 public:
  // `section` outlives the decoder.
  ListDecoder(const Platform& platform, const ListSection& section) : Base(platform), section_(section) {}

  Outcome updateWithData(RecordView record, LogCode logCode) override;
  std::string_view getSectionName() const override { return section_.name; }
  SectionKind sectionKind() const override { return SectionKind::list; }
  std::span<const LogCode> getLogCodeArray() const override { return section_.logCodes; }
  CellRole role() const override { return section_.role; }
  void describe(RowCatalog& catalog) const override;

 protected:
  // Adds what the section shows of one entry, if anything; unless overridden, the rows of the table.
  virtual void addEntry(RecordView record, std::size_t place);
  // A record that neither table describes; unless overridden, the unknown-message line, or none.
  virtual Outcome decodeOther(RecordView record, LogCode logCode);

  // Which cell an entry is; unless overridden, what its fields say.
  virtual CellIdentity cellOf(RecordView record, std::size_t place) const;
  RowWriter addRows() { return list_.add(); }
  RecordView entry(RecordView record, std::size_t place) const {
    return entryOf(record, section_.list, place);
  }

 private:
  Outcome showList(RecordView record);
  Outcome showCells(RecordView record);
  // Where readings go; null when nothing is shown.
  Readings* listReadings() const { return sectionList() && !section_.staysEmpty ? readings() : nullptr; }
  RecordPart whole(const RecordPart& part) const;
  void clearList();
  void startList();

  const ListSection& section_;
  RowList list_;
};

// A decoder that is a table and nothing else.
template <const ListSection& section>
class ListTable : public ListDecoder {
 public:
  explicit ListTable(const Platform& platform) : ListDecoder(platform, section) {}
};

}  // namespace kelvasi
