// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/CellWords.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <vector>

#include "Radio/CellCarriers.h"

namespace kelvasi::cockpit {

namespace {

struct FamilyWords {
  RadioFamily family;
  std::string_view technology;
  std::string_view channel;
  std::string_view code;
};
constexpr std::array families{
    FamilyWords{RadioFamily::gsm, "GSM", "ARFCN", "BSIC"},
    FamilyWords{RadioFamily::umts, "UMTS", "UARFCN", "PSC"},
    FamilyWords{RadioFamily::utraTdd, "UTRA TDD", "UARFCN", "CPI"},
    FamilyWords{RadioFamily::lte, "LTE", "E-ARFCN", "PCI"},
    FamilyWords{RadioFamily::cdma, "1x", "Channel", "PN"},
    FamilyWords{RadioFamily::evdo, "EV-DO", "Channel", "PN"},
};

FamilyWords wordsOf(RadioFamily family) {
  const auto found = std::ranges::find(families, family, &FamilyWords::family);
  return found == families.end() ? FamilyWords{} : *found;
}

std::string numberOr(std::int64_t number, std::string_view otherwise) {
  return number == CellIdentity::unknown ? std::string(otherwise) : std::to_string(number);
}

std::optional<std::int64_t> numberIn(std::string_view text) {
  std::int64_t number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || end != text.data() + text.size()) return std::nullopt;
  return number;
}

template <typename Append>
std::string listed(const Carriers& carriers, Append&& append) {
  std::vector<std::string> texts;
  for (const Carrier& carrier : carriers) {
    std::string text;
    append(text, carrier);
    if (std::ranges::find(texts, text) == texts.end()) texts.push_back(std::move(text));
  }
  // More than a few say nothing any more.
  if (texts.size() > 3) return {};
  std::string joined;
  for (const std::string& text : texts) joined += (joined.empty() ? "" : " or ") + text;
  return joined;
}

}  // namespace

std::string_view technologyWord(RadioFamily family) {
  return wordsOf(family).technology;
}

std::string_view channelWord(RadioFamily family) {
  return wordsOf(family).channel;
}

std::string_view codeWord(RadioFamily family) {
  return wordsOf(family).code;
}

std::string cellName(const CellIdentity& cell) {
  if (!cell) return {};
  if (cell.code == CellIdentity::unknown)
    return std::string(channelWord(cell.family)) + " " + numberOr(cell.channel, "unknown");
  return std::string(codeWord(cell.family)) + " " + std::to_string(cell.code);
}

std::string fullCellName(const CellIdentity& cell) {
  if (!cell) return {};
  std::string text = std::string(technologyWord(cell.family)) + " " + numberOr(cell.channel, "?");
  if (cell.code != CellIdentity::unknown) text += "/" + std::to_string(cell.code);
  return text;
}

std::optional<CellIdentity> cellFromText(std::string_view text) {
  const auto colon = text.find(':');
  if (colon == std::string_view::npos) return std::nullopt;
  CellIdentity cell;
  for (const FamilyWords& words : families) {
    if (text.substr(0, colon) == nameOf(words.family)) cell.family = words.family;
  }
  const auto rest = text.substr(colon + 1);
  const auto slash = std::min(rest.find('/'), rest.size());
  if (!cell) return std::nullopt;
  if (const auto channel = numberIn(rest.substr(0, slash))) cell.channel = *channel;
  if (slash < rest.size()) cell.code = numberIn(rest.substr(slash + 1)).value_or(CellIdentity::unknown);
  // What does not read back was no cell.
  return textOf(cell) == text ? std::optional(cell) : std::nullopt;
}

CarrierWords carrierWords(const CellIdentity& cell, std::optional<std::int64_t> bandClass) {
  const Carriers carriers = carriersOf(cell, bandClass);
  CarrierWords words;
  words.bands =
      listed(carriers, [](std::string& text, const Carrier& carrier) { text += carrier.band.name; });
  words.frequency = listed(
      carriers, [](std::string& text, const Carrier& carrier) { appendMegahertz(text, carrier.downlink); });
  if (!words.frequency.empty()) words.frequency += " MHz";
  return words;
}

}  // namespace kelvasi::cockpit
