// SPDX-License-Identifier: Apache-2.0
#include "Redaction/NameBook.h"

#include <algorithm>

#include "Redaction/NamedIdentities.h"

namespace kelvasi {

namespace {

bool isDigit(char character) {
  return character >= '0' && character <= '9';
}

const NamedIdentity* entryOf(std::string_view name) {
  const std::string plain = plainName(name);
  const auto fits = [&](const NamedIdentity& each) {
    return each.isPart ? plain.find(each.name) != std::string::npos : plain == each.name;
  };
  const auto found = std::ranges::find_if(namedIdentities, fits);
  return found == namedIdentities.end() ? nullptr : &*found;
}

// "2024-03-05 14:07:09" says when, and not who.
void removeMoments(std::string& text) {
  constexpr std::string_view shape = "0000-00-00 00:00:00";
  for (std::size_t at = 0; at + shape.size() <= text.size(); ++at) {
    const auto fits = [](char one, char other) { return other == '0' ? isDigit(one) : one == other; };
    if (std::equal(shape.begin(), shape.end(), text.begin() + static_cast<std::ptrdiff_t>(at),
                   [&](char other, char one) { return fits(one, other); }))
      text.erase(at, text.compare(at + shape.size(), 6, " +0000") == 0 ? shape.size() + 6 : shape.size());
  }
}

NamedValue valueOf(const Quantity& quantity) {
  return {whatIdentifies(quantity), quantity.id};
}

}  // namespace

std::string plainName(std::string_view name) {
  std::string plain;
  for (const char each : name) {
    if (isDigit(each) || (each >= 'a' && each <= 'z')) plain += each;
    if (each >= 'A' && each <= 'Z') plain += static_cast<char>(each - 'A' + 'a');
  }
  return plain;
}

// A text is known by its name alone.
void NameBook::learn(const RowCatalog& catalog) {
  for (const CatalogRow& row : catalog.rows()) {
    const Quantity& quantity = row.row->quantity;
    if (&quantity == &quantity::text || !row.row->hasNumber) continue;
    rows_.insert({row.key, {row.section, valueOf(quantity)}});
    if (!row.source.empty()) rows_.insert({row.source, {"", valueOf(quantity)}});
  }
}

// Names that only group others are short and in the list; what they hold is as they say.
std::optional<NamedValue> NameBook::of(std::span<const std::string> path) const {
  if (const NamedValue* known = learned(path)) return *known;
  for (auto name = path.rbegin(); name != path.rend(); ++name) {
    if (const NamedIdentity* entry = entryOf(*name)) return NamedValue{entry->identifies, entry->name};
  }
  return std::nullopt;
}

const NamedValue* NameBook::learned(std::span<const std::string> path) const {
  const auto key = std::find_if(path.rbegin(), path.rend(), [](const auto& each) { return !each.empty(); });
  if (key == path.rend()) return nullptr;
  const auto [first, last] = rows_.equal_range(*key);
  for (auto row = first; row != last; ++row) {
    const Known& known = row->second;
    if (known.section.empty() || std::ranges::find(path, known.section) != path.end()) return &known.value;
  }
  return nullptr;
}

bool couldIdentify(std::string_view whole) {
  std::string text(whole);
  removeMoments(text);
  constexpr std::size_t longNumber = 5;
  std::size_t digits = 0;
  std::size_t colons = 0;
  std::size_t dots = 0;
  for (const char each : text) {
    if (each == '@') return true;
    colons += each == ':';
    dots += each == '.';
    // What is written between the digits of a telephone number.
    const bool isBetween = each == ' ' || each == '-' || each == '/' || each == '(' || each == ')';
    digits = isDigit(each) ? digits + 1 : (isBetween ? digits : 0);
    if (digits >= longNumber) return true;
  }
  const bool hasDigit = std::ranges::any_of(text, isDigit);
  return hasDigit && (colons >= 2 || dots >= 3);
}

}  // namespace kelvasi
