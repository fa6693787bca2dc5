// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/StateDecoder.h"

#include <algorithm>

namespace kelvasi {

namespace {

constexpr std::array<std::string_view, 2> versionNames{"version", "layout version"};

std::size_t columnsIn(std::span<const RecordRows> records) {
  std::size_t count = 0;
  for (const RecordRows& record : records) count += record.lists.size();
  return count;
}

}  // namespace

StateDecoder::StateDecoder(const Platform& platform, const StateSection& section)
    : Base(platform), section_(section), lists_(columnsIn(section.records)) {}

Outcome StateDecoder::updateWithData(RecordView record, LogCode logCode) {
  trace(section_.trace);
  if (logCode == cellInfoLogCode && section_.cells) return showCell(record);
  const auto rows = std::ranges::find(section_.records, logCode, &RecordRows::logCode);
  return rows == section_.records.end() ? decodeOther(record, logCode) : showRows(record, *rows);
}

Outcome StateDecoder::showRows(RecordView record, const RecordRows& rows) {
  if (record.size() < rows.minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  const std::size_t before = readings() ? readings()->count() : 0;
  show(record, rows.layout, rows.rows, writer);
  showLists(record, rows);
  if (readings() && rows.cell.family != RadioFamily::none)
    readings()->identify(before, servingCellOf(rows.cell, record, rows.logCode, readings()->servingCells()));
  return Outcome::shown;
}

void StateDecoder::showLists(RecordView record, const RecordRows& rows) {
  const auto before = static_cast<std::size_t>(&rows - section_.records.data());
  std::size_t place = columnsIn(section_.records.first(before));
  for (const ListColumn& column : rows.lists)
    lists_[place++].show(record, column, *sectionRows(), this->place());
}

// An unbound section gets the same lines into the system log.
Outcome StateDecoder::showCell(RecordView record) {
  PlistDictionary nowhere;
  const bool isShown =
      showFirstCell(platform(), record, *section_.cells, sectionRows() ? *sectionRows() : nowhere, place());
  return isShown ? rowsOutcome() : Outcome::propertyListRefused;
}

Outcome StateDecoder::decodeOther(RecordView, LogCode logCode) {
  if (!section_.isSilent) logUnknownMessage(logCode);
  return Outcome::notAskedFor;
}

void StateDecoder::describe(RowCatalog& catalog) const {
  for (const RecordRows& record : section_.records) {
    catalog.add(section_.name, {.logCode = record.logCode,
                                .layout = record.layout,
                                .rows = record.rows,
                                .minimumLength = record.minimumLength});
    for (const ListColumn& column : record.lists)
      catalog.add(section_.name, {.logCode = record.logCode,
                                  .layout = column.list.layout,
                                  .rows = column.element ? std::span(column.element, 1) : column.rows,
                                  .of = "entry",
                                  .list = column.key,
                                  .minimumLength = record.minimumLength,
                                  .entries = &column.list});
  }
  for (const RecordPart& part : section_.others) catalog.add(section_.name, part);
  if (section_.cells) section_.cells->describe(section_.name, catalog);
}

std::optional<std::size_t> StateDecoder::versionAt(LogCode logCode) const {
  const auto rows = std::ranges::find(section_.records, logCode, &RecordRows::logCode);
  if (rows == section_.records.end()) return std::nullopt;
  const auto field = std::ranges::find_first_of(rows->layout, versionNames, {}, &Field::name);
  return field == rows->layout.end() ? std::nullopt : std::optional(field->byte);
}

}  // namespace kelvasi
