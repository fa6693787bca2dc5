// SPDX-License-Identifier: Apache-2.0
#include "Redaction/PlistRedactor.h"

#include <algorithm>
#include <map>
#include <utility>

#include "Redaction/PieceValue.h"

namespace kelvasi {

namespace {

using Form = PlistPiece::Form;

constexpr std::uint64_t longNumber = 100'000;
constexpr std::size_t longData = 5;

bool couldIdentify(const PlistPiece& piece) {
  if (const auto number = numberIn(piece)) return *number >= longNumber;
  if (piece.form == Form::decimal || piece.form == Form::binary || piece.form == Form::base64)
    return dataIn(piece).size() >= longData;
  return kelvasi::couldIdentify(textIn(piece));
}

// A text that is one number, and nothing else, and the base that it is written in.
struct NumberText {
  std::uint64_t number = 0;
  bool isHexadecimal = false;
};
std::optional<NumberText> numberText(const std::string& text) {
  std::string copy = text;
  const std::span bytes(reinterpret_cast<std::uint8_t*>(copy.data()), copy.size());
  const auto number = numberIn({.form = Form::decimal, .path = {}, .bytes = bytes});
  if (!number) return std::nullopt;
  return NumberText{*number, text.starts_with("0x") || text.starts_with("0X")};
}

// As long as before: with zeros in front.
std::string inDigits(const NumberText& number, std::size_t size) {
  constexpr std::string_view digits = "0123456789ABCDEF";
  const unsigned base = number.isHexadecimal ? 16 : 10;
  std::string text(size, '0');
  std::uint64_t left = number.number;
  for (std::size_t at = size; at > (number.isHexadecimal ? 2u : 0u); --at, left /= base)
    text[at - 1] = digits[left % base];
  if (number.isHexadecimal) text[1] = 'x';
  return text;
}

std::string replaced(const std::string& text, const NamedValue& value, const Replacement& replacement) {
  const auto number = value.identifies == Identifies::place ? numberText(text) : std::nullopt;
  if (number)
    return inDigits({replacement.number(value.kind, number->number), number->isHexadecimal}, text.size());
  std::string result = text;
  std::ranges::replace(result, '&', 'x');  // no reference any more
  replacement.replaceText({reinterpret_cast<std::uint8_t*>(result.data()), result.size()});
  return result;
}

// Nothing that tells one text from another.
bool isBlanked(const std::string& text) {
  return std::ranges::all_of(text, [](char each) {
    const bool isLetter = (each >= 'a' && each <= 'z') || (each >= 'A' && each <= 'Z') || (each & 0x80) != 0;
    return each == 'x' || each == '0' || (!isLetter && (each < '0' || each > '9'));
  });
}

}  // namespace

std::optional<NamedValue> PlistRedactor::toReplace(const PlistPiece& piece, RedactionCounts& counts) const {
  if (const auto value = book_.of(piece.path)) {
    if (!isChosen(*value)) return std::nullopt;
    ++(value->identifies == Identifies::place ? counts.places : counts.identities);
    return value;
  }
  if (choice_.keepsUnknown || piece.form == Form::moment || !couldIdentify(piece)) return std::nullopt;
  ++counts.unknownValues;
  return NamedValue{Identifies::subscriber, "unknown"};
}

bool PlistRedactor::isChosen(const NamedValue& value) const {
  return value.identifies == Identifies::subscriber ||
         (value.identifies == Identifies::place && !choice_.keepsCells);
}

bool PlistRedactor::redact(std::span<std::uint8_t> document, RemovedIdentities& removed,
                           RedactionCounts& counts, const Nested& nested) const {
  const auto before = plists_.parse(document);
  RedactionCounts found = counts;
  Changes changes;
  const auto take = [&](const PlistPiece& piece) {
    if (!nested || !redactNested(piece, nested)) note(piece, found, changes);
  };
  if (!before || !forEachPiece(document, take)) return false;
  for (const auto& [place, change] : changes) replace(change, removed);
  const auto after = plists_.parse(document);
  std::vector<std::string> path;
  const bool isXml = document.front() == '<' && !nested;
  if (!after || !isWellRedacted(*before, *after, path, isXml)) return false;
  counts = found;
  return true;
}

bool PlistRedactor::redactNested(const PlistPiece& piece, const Nested& nested) {
  Bytes data = dataIn(piece);
  if (data.empty() || piece.path.empty() || !nested(piece.path.back(), data)) return false;
  writeData(piece, data);
  return true;
}

// In a binary document several values may be the same bytes.
void PlistRedactor::note(const PlistPiece& piece, RedactionCounts& counts, Changes& changes) const {
  const bool isAside = piece.form == Form::aside && !choice_.keepsUnknown;
  const auto value = isAside ? std::optional(NamedValue()) : toReplace(piece, counts);
  if (value)
    changes.try_emplace(piece.bytes.data(), Change{{piece.form, {}, piece.bytes, piece.isData}, *value});
}

void PlistRedactor::replace(const Change& change, RemovedIdentities& removed) const {
  const PlistPiece& piece = change.piece;
  switch (piece.form) {
    case Form::text:
    case Form::utf16:
      return replaceText(change, removed);
    case Form::decimal:
      return replaceNumber(change, removed);
    case Form::binary:
      return piece.isData ? replaceData(change, removed) : replaceNumber(change, removed);
    case Form::base64:
      return replaceData(change, removed);
    case Form::moment:
      std::ranges::replace_if(
          piece.bytes, [](auto each) { return each >= '0' && each <= '9'; }, '0');
      return;
    case Form::aside:
      std::ranges::fill(piece.bytes, std::uint8_t{' '});
  }
}

void PlistRedactor::replaceText(const Change& change, RemovedIdentities& removed) const {
  const std::string text = textIn(change.piece);
  const std::string other = replaced(text, change.value, replacement_);
  if (change.value.identifies == Identifies::subscriber && other != text) removed.addText(text);
  writeText(change.piece, other);
}

void PlistRedactor::replaceNumber(const Change& change, RemovedIdentities& removed) const {
  const auto number = numberIn(change.piece);
  if (change.value.identifies == Identifies::subscriber && number) removed.addText(std::to_string(*number));
  writeNumber(change.piece, number ? replacement_.number(change.value.kind, *number) : 0);
}

void PlistRedactor::replaceData(const Change& change, RemovedIdentities& removed) const {
  Bytes data = dataIn(change.piece);
  if (change.value.identifies == Identifies::subscriber) removed.addBytes(data);
  replacement_.replaceBytes(data);
  writeData(change.piece, data);
}

// The same keys and kinds, what names somebody is another, and in XML everything else is the same.
bool PlistRedactor::isWellRedacted(const PlistValue& before, const PlistValue& after,
                                   std::vector<std::string>& path, bool isXml) const {
  const auto under = [&](const std::string& name, const PlistValue& one, const PlistValue& other) {
    path.push_back(name);
    const bool isWell = isWellRedacted(one, other, path, isXml);
    path.pop_back();
    return isWell;
  };
  if (const PlistDictionary* entries = before.dictionary()) {
    const PlistDictionary* others = after.dictionary();
    return others && entries->size() == others->size() &&
           std::equal(entries->begin(), entries->end(), others->begin(),
                      [&](const auto& one, const auto& other) {
                        return one.first == other.first && under(one.first, one.second, other.second);
                      });
  }
  if (const PlistArray* elements = before.array()) {
    const PlistArray* others = after.array();
    return others && elements->size() == others->size() &&
           std::equal(elements->begin(), elements->end(), others->begin(),
                      [&](const PlistValue& one, const PlistValue& other) { return under("", one, other); });
  }
  const auto value = book_.of(path);
  if (!value || !isChosen(*value)) return !isXml || !value || before == after;
  const std::string* text = after.string();
  return !before.string() || (text && (!replacement_.isBlank() || isBlanked(*text)));
}

}  // namespace kelvasi
