// SPDX-License-Identifier: Apache-2.0
#include "Radio/Operators.h"

#include <algorithm>

#include "Radio/CsvLine.h"
#include "Radio/OperatorTables.h"

namespace kelvasi {

namespace {

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

bool isControl(char character) {
  return static_cast<unsigned char>(character) < 0x20 || character == 0x7F;
}

std::string_view builtInName(const NetworkId& network) {
  const auto table = networkTable();
  const auto entry = std::ranges::lower_bound(table, network, {}, &NetworkEntry::network);
  return entry != table.end() && entry->network == network ? entry->name : std::string_view();
}

std::string_view countryOf(std::uint16_t mcc) {
  const auto table = countryTable();
  const auto entry = std::ranges::lower_bound(table, mcc, {}, &CountryEntry::mcc);
  return entry != table.end() && entry->mcc == mcc ? entry->name : std::string_view();
}

// Takes a line off the front, without its end.
std::string_view takeLine(std::string_view& text) {
  const std::size_t end = std::min(text.find('\n'), text.size());
  std::string_view line = text.substr(0, end);
  text.remove_prefix(std::min(end + 1, text.size()));
  if (line.ends_with('\r')) line.remove_suffix(1);
  return line;
}

}  // namespace

std::vector<Operators::Fault> Operators::addNames(std::string_view csv) {
  if (csv.starts_with(byteOrderMark)) csv.remove_prefix(byteOrderMark.size());
  std::vector<Fault> faults;
  for (std::size_t number = 1; !csv.empty(); ++number) {
    const std::string_view line = takeLine(csv);
    if (line.empty() || line.starts_with('#')) continue;
    if (std::string fault = addLine(line); !fault.empty()) faults.push_back({number, std::move(fault)});
  }
  return faults;
}

// What is wrong with the line; empty when it was added.
std::string Operators::addLine(std::string_view line) {
  if (std::ranges::any_of(line, isControl)) return "holds a control character";
  auto fields = csvFields(line);
  if (!fields) return "has a quote that is not closed before a comma or the end";
  if (fields->size() < 3 || fields->size() > 4) return "is not MCC, MNC, name and, if wanted, country";
  fields->resize(4);
  const auto network = networkIdFromDigits((*fields)[0], (*fields)[1]);
  if (!network) return "does not begin with an MCC of three digits and an MNC of two or three";
  if ((*fields)[2].empty()) return "has no name";
  own_[*network] = {std::move((*fields)[2]), std::move((*fields)[3])};
  return {};
}

Operators::Names Operators::findExactly(const NetworkId& network) const {
  const auto own = own_.find(network);
  if (own == own_.end()) return {builtInName(network), countryOf(network.mcc)};
  const OwnNames& names = own->second;
  return {names.name, names.country.empty() ? countryOf(network.mcc) : std::string_view(names.country)};
}

NetworkId Operators::withDigits(const NetworkId& network) const {
  if (network.mncDigits != 0) return network;
  const NetworkId ofTwo{network.mcc, network.mnc, 2};
  const NetworkId ofThree{network.mcc, network.mnc, 3};
  const bool hasTwo = !findExactly(ofTwo).name.empty();
  const bool hasThree = !findExactly(ofThree).name.empty();
  if (hasTwo == hasThree) return network;
  return hasTwo ? ofTwo : ofThree;
}

Operators::Names Operators::find(const NetworkId& network) const {
  return findExactly(withDigits(network));
}

std::string Operators::describe(const NetworkId& network) const {
  const NetworkId known = withDigits(network);
  const Names names = findExactly(known);
  std::string text = textOf(known);
  if (!names.name.empty()) text.append(" ").append(names.name);
  if (!names.country.empty()) text.append(" (").append(names.country).append(")");
  return text;
}

}  // namespace kelvasi
