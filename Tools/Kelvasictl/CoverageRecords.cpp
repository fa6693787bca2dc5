// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CoverageRecords.h"

#include <algorithm>
#include <array>
#include <utility>

#include "Tools/Kelvasictl/LogCodeText.h"
#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

constexpr std::array columns{
    Column{.key = "technology"},
    Column{.key = "code", .width = 8},
    Column{.key = "outcome", .width = 21},
    Column{.key = "messages", .width = 9, .isNumber = true},
    Column{.key = "share", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "first", .width = 19, .isTime = true},
    Column{.key = "last", .width = 19, .isTime = true},
    Column{.key = "length", .width = 6, .isNumber = true},
    Column{.key = "version", .width = 7, .isNumber = true},
    Column{.key = "nearest", .width = 8},
    Column{.key = "sample"},
};

std::string inHex(std::span<const std::uint8_t> bytes) {
  constexpr std::string_view digits = "0123456789abcdef";
  std::string text;
  for (const std::uint8_t byte : bytes) text.append({digits[byte >> 4], digits[byte & 0xF]});
  return text;
}

// The known code beside one that is not; the smaller of two that are as near.
Json nearest(const IntakeCount& count, std::span<const LogCode> known) {
  if (count.outcome != Outcome::notAskedFor) return {};
  const auto away = [&](LogCode code) {
    return std::max(code, count.logCode) - std::min(code, count.logCode);
  };
  const auto found =
      std::ranges::min_element(known, {}, [&](LogCode code) { return std::pair(away(code), code); });
  return found == known.end() ? Json() : Json(logCodeText(*found));
}

void add(IntakeCount& to, const IntakeCount& count) {
  const bool isNewer = count.last >= to.last;
  to.messages += count.messages;
  to.first = std::min(to.first, count.first);
  if (!isNewer) return;
  to.last = count.last;
  to.lastLength = count.lastLength;
  to.lastVersion = count.lastVersion;
}

struct CodeList {
  std::string_view key;
  LogCode base;
};
constexpr std::array codeLists{CodeList{"SetOrvaneLogCodes", 0},
                               CodeList{"SetTelvonExtraCodes", extraLogCodes}};

}  // namespace

std::span<const Column> coverageColumns() {
  return columns;
}

void Coverage::add(std::string_view technology, const Intake& intake, std::span<const LogCode> known) {
  for (const IntakeCount& count : intake.counts()) {
    const auto [counted, isNew] =
        counts_.try_emplace(Key(technology, count.logCode, count.outcome),
                            Counted{std::string(technology), count, nearest(count, known)});
    if (!isNew) kelvasi::add(counted->second.count, count);
  }
  messages_ += intake.messages();
  beyond_ += intake.beyond();
}

std::vector<Json> Coverage::records() const {
  std::vector<const Counted*> order;
  for (const auto& [key, counted] : counts_) order.push_back(&counted);
  std::ranges::stable_sort(order, std::ranges::greater(),
                           [](const Counted* each) { return each->count.messages; });
  std::vector<Json> records;
  for (const Counted* counted : order) records.push_back(recordOf(*counted));
  if (beyond_ > 0) records.push_back(recordOfBeyond());
  return records;
}

Json Coverage::recordOf(const Counted& counted) const {
  const IntakeCount& count = counted.count;
  const bool hasCode = count.logCode != 0 && count.outcome != Outcome::notARecord;
  Json record;
  record["technology"] = counted.technology;
  record["code"] = hasCode ? Json(logCodeText(count.logCode)) : Json();
  record["outcome"] = nameOf(count.outcome);
  record["messages"] = count.messages;
  record["share"] = shareOf(count.messages);
  record["first"] = rfc3339(count.first);
  record["last"] = rfc3339(count.last);
  record["length"] = count.lastLength;
  record["version"] = count.lastVersion ? Json(*count.lastVersion) : Json();
  record["nearest"] = counted.nearest;
  record["sample"] = inHex(std::span(count.sample).first(count.sampled));
  return record;
}

// Codes past the most that an intake tells apart.
Json Coverage::recordOfBeyond() const {
  Json record;
  for (const Column& column : columns) record[std::string(column.key)] = nullptr;
  record["outcome"] = "of further codes";
  record["messages"] = beyond_;
  record["share"] = shareOf(beyond_);
  return record;
}

double Coverage::shareOf(std::uint64_t messages) const {
  return 100 * static_cast<double>(messages) / static_cast<double>(messages_);
}

std::vector<LogCode> logCodesAsked(const LogGenerator& generator) {
  std::vector<LogCode> asked;
  const PlistValue command = generator.getStartCommand();
  for (const CodeList& list : codeLists) {
    const PlistValue codes = command.dictionary() ? command.dictionary()->get(list.key) : PlistValue();
    if (!codes.array()) continue;
    for (const PlistValue& code : *codes.array()) {
      if (code.integer()) asked.push_back(list.base + static_cast<LogCode>(*code.integer()));
    }
  }
  return asked;
}

}  // namespace kelvasi
