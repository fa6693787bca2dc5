// SPDX-License-Identifier: Apache-2.0
#include "Capture/TechnologyCount.h"

#include <algorithm>

#include "Capture/PlistBeginning.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/RecordFraming.h"
#include "Platform/Clock.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"
#include "Telvon/Technology.h"
#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

// What a generator needs to say what it asks for, and nothing that anybody would notice.
struct Silence : SystemLog, TraceOutput, PlistSerialiser, Resources, Clock {
  bool wants(LogPriority) const override { return false; }
  void write(LogPriority, std::string_view) override {}
  void writeLine(std::string_view) override {}
  std::optional<PlistValue> parse(std::span<const std::uint8_t>) const override { return std::nullopt; }
  std::optional<Bytes> serialiseXml(const PlistValue&) const override { return std::nullopt; }
  std::optional<Bytes> serialiseBinary(const PlistValue&) const override { return std::nullopt; }
  // The generator that finds its template by name asks for nothing where there is none.
  std::vector<std::string> pathsOfType(std::string_view) const override { return {"UTRAN.plist"}; }
  std::optional<Bytes> contents(std::string_view, std::string_view) const override { return std::nullopt; }
  std::optional<std::string> bundleVersion() const override { return std::nullopt; }
  std::string buildTime() const override { return {}; }
  PlistDate now() const override { return {}; }
  ZoneState localZone(PlistDate) const override { return {}; }
};

PlistValue codesOf(std::string_view technology) {
  Silence silence;
  const auto generator =
      LogGenerator::generatorFromTechnology(technology, {silence, silence, silence, silence, silence});
  return generator->getStartCommand().dictionary()->get("SetOrvaneLogCodes");
}

// Records that the telephony daemon supplies come with several technologies.
bool isDaemons(std::span<const std::uint8_t> message) {
  const auto framed = frameRecord(message);
  return framed && framed->logType == 0xFF;
}

std::size_t placeOf(std::string_view technology) {
  return static_cast<std::size_t>(std::ranges::find(technologyIds(), technology) - technologyIds().begin());
}

}  // namespace

TechnologyCodes::TechnologyCodes() : byCode_(65536) {
  for (const std::string_view technology : technologyIds()) {
    const PlistValue codes = codesOf(technology);
    if (!codes.array()) continue;
    for (const PlistValue& code : *codes.array())
      byCode_.at(static_cast<std::size_t>(*code.integer())) =
          static_cast<std::uint8_t>(placeOf(technology) + 1);
  }
}

std::optional<std::size_t> TechnologyCodes::technologyOf(std::span<const std::uint8_t> message) const {
  if (beginsAsPlist(message)) return placeOf(kTelvonLogChannelTechnology_IFX);
  const auto framed = frameRecord(message);
  if (!framed || framed->logCode >= byCode_.size() || byCode_[framed->logCode] == 0) return std::nullopt;
  return byCode_[framed->logCode] - 1u;
}

TechnologyCount::TechnologyCount(const TechnologyCodes& codes)
    : codes_(codes), counts_(technologyIds().size()) {}

void TechnologyCount::count(std::span<const std::uint8_t> message) {
  ++messages_;
  if (const auto place = codes_.technologyOf(message)) {
    ++counts_[*place];
  } else if (!isDaemons(message)) {
    ++strangers_;
  }
}

std::uint64_t TechnologyCount::of(std::string_view technology) const {
  return counts_.at(placeOf(technology));
}

std::vector<std::string_view> TechnologyCount::ranking() const {
  std::vector<std::string_view> ranked;
  std::ranges::copy_if(technologyIds(), std::back_inserter(ranked), [this](auto id) { return of(id) > 0; });
  std::ranges::stable_sort(ranked, std::ranges::greater(), [this](auto id) { return of(id); });
  return ranked;
}

std::string TechnologyCount::text(std::span<const std::string_view> technologies) const {
  std::string text;
  for (const std::string_view& technology : technologies) {
    const bool isFirst = text.empty();
    if (!isFirst) text += &technology == &technologies.back() ? " and " : ", ";
    text += std::string(shortTechnologyName(technology)) + " (" + std::to_string(of(technology));
    text += isFirst ? " of " + std::to_string(messages_) + " messages)" : ")";
  }
  return text;
}

}  // namespace kelvasi
