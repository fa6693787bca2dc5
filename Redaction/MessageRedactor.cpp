// SPDX-License-Identifier: Apache-2.0
#include "Redaction/MessageRedactor.h"

#include <algorithm>
#include <array>
#include <string>

#include "LogGenerator/RecordFraming.h"

namespace kelvasi {

namespace {

constexpr std::size_t codeOffset = 3;  // in a record
constexpr std::uint8_t unknownCode = 0xFF;

bool beginsAsList(std::span<const std::uint8_t> bytes) {
  constexpr std::array<std::string_view, 4> beginnings{"bplist", "<?xml", "<!DOCTYPE plist", "<plist"};
  const std::string_view text(reinterpret_cast<const char*>(bytes.data()), bytes.size());
  return std::ranges::any_of(beginnings, [&](std::string_view each) { return text.starts_with(each); });
}

// The value's bits where the layout has them, as far as the record goes.
void put(std::span<std::uint8_t> record, const Field& field, std::uint64_t value) {
  if (field.isBigEndian) value = (value & 0xFF) << 8 | (value >> 8 & 0xFF);
  for (std::size_t bit = field.firstBit(); bit < field.endBit() && bit / 8 < record.size();
       ++bit, value >>= 1) {
    const auto mask = static_cast<std::uint8_t>(1u << bit % 8);
    std::uint8_t& byte = record[bit / 8];
    byte = static_cast<std::uint8_t>((value & 1) != 0 ? byte | mask : byte & ~mask);
  }
}

std::uint64_t unsignedValueOf(RecordView record, Field field) {
  field.isSigned = false;
  return static_cast<std::uint64_t>(valueOf(record, field));
}

}  // namespace

MessageRedactor::MessageRedactor(std::span<const RowCatalog> catalogs, const PlistSerialiser& plists,
                                 const Replacement& replacement, RedactionChoice choice)
    : plists_(plists),
      replacement_(replacement),
      choice_(choice),
      plistRedactor_(book_, plists, replacement, choice) {
  for (const RowCatalog& catalog : catalogs) {
    book_.learn(catalog);
    for (const CatalogRow& row : catalog.rows()) learn(row);
  }
}

// A row that shows a field as no number of the quantity shows another one's field.
void MessageRedactor::learn(const CatalogRow& row) {
  std::vector<Place>& places = places_[row.logCode];
  if (!row.source.empty()) listCodes_.insert(row.logCode);
  const Quantity& quantity = row.row->quantity;
  const Identifies identifies = whatIdentifies(quantity);
  const bool isKept = identifies == Identifies::place && choice_.keepsCells;
  if (identifies == Identifies::nothing || isKept || !row.field || !row.row->hasNumber) return;
  places.push_back({*row.field, {identifies, quantity.id}});
}

void MessageRedactor::redact(std::span<std::uint8_t> message) {
  const auto framed = frameRecord(message);
  if (beginsAsList(message)) {
    if (!redactPlist(message)) blank(message);
  } else if (!framed) {
    blank(message);
  } else {
    const auto record = message.last(framed->record.size());
    const auto known = places_.find(framed->logCode);
    if (listCodes_.contains(framed->logCode)) return redactListIn(message, record);
    if (framed->hasKnownType() && known != places_.end()) return redactFields(record, known->second);
    redactUnknown(record.subspan(std::min(record.size(), RecordView::headerSize)));
  }
}

void MessageRedactor::redactUnknown(std::span<std::uint8_t> bytes) {
  if (choice_.keepsUnknown) return;
  std::ranges::fill(bytes, std::uint8_t{0});
  ++counts_.unknownMessages;
}

void MessageRedactor::redactFields(std::span<std::uint8_t> record, std::span<const Place> places) {
  std::vector<std::uint64_t> values;
  for (const Place& place : places) values.push_back(unsignedValueOf(RecordView(record), place.field));
  for (std::size_t at = 0; at < places.size(); ++at) {
    const auto& [field, value] = places[at];
    if (record.size() <= field.byte) continue;
    put(record, field, replacement_.number(value.kind, values[at]));
    ++(value.identifies == Identifies::place ? counts_.places : counts_.identities);
  }
}

// What it holds is a list or nothing. One that is not understood makes the message one of a code that nobody
// knows, as without its list it would end those who read it.
void MessageRedactor::redactListIn(std::span<std::uint8_t> message, std::span<std::uint8_t> record) {
  const auto payload = record.subspan(std::min(record.size(), RecordView::headerSize));
  const Bytes before(payload.begin(), payload.end());
  if (redactPlist(payload)) return;
  blank(payload);
  if (plists_.parse(before))
    std::ranges::fill(message.last(record.size()).subspan(codeOffset, 2), unknownCode);
}

bool MessageRedactor::redactPlist(std::span<std::uint8_t> document, const PlistRedactor::Nested& nested) {
  return plistRedactor_.redact(document, removed_, counts_, nested);
}

void MessageRedactor::redactText(std::span<std::uint8_t> text) {
  const std::string words(text.begin(), text.end());
  if (choice_.keepsUnknown || !couldIdentify(words)) return;
  removed_.addText(words);
  replacement_.replaceText(text);
  ++counts_.unknownValues;
}

void MessageRedactor::blank(std::span<std::uint8_t> bytes) {
  std::ranges::fill(bytes, std::uint8_t{0});
  ++counts_.unreadable;
}

}  // namespace kelvasi
