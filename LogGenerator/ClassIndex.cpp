// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ClassIndex.h"

#include <algorithm>

#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"

namespace kelvasi {

void ClassDictionary::set(std::string_view sectionName, Base& decoder) {
  const auto entry = std::ranges::find(entries_, sectionName, &std::pair<std::string, Base*>::first);
  if (entry == entries_.end()) {
    entries_.emplace_back(sectionName, &decoder);
  } else {
    entry->second = &decoder;
  }
}

Base* ClassDictionary::find(std::string_view sectionName) const {
  const auto entry = std::ranges::find(entries_, sectionName, &std::pair<std::string, Base*>::first);
  return entry == entries_.end() ? nullptr : entry->second;
}

void CodeDictionary::append(LogCode logCode, Base& decoder) {
  const auto code = std::ranges::find(codes_, logCode);
  const auto place = static_cast<std::size_t>(code - codes_.begin());
  if (code == codes_.end()) {
    codes_.push_back(logCode);
    subscribers_.emplace_back();
  }
  subscribers_[place].push_back(&decoder);
}

std::span<Base* const> CodeDictionary::find(LogCode logCode) const {
  const auto code = std::ranges::find(codes_, logCode);
  if (code == codes_.end()) return {};
  return subscribers_[static_cast<std::size_t>(code - codes_.begin())];
}

std::vector<std::string> CodeDictionary::keys() const {
  std::vector<std::string> keys;
  for (const LogCode code : codes_) keys.push_back(std::to_string(code));
  return keys;
}

ClassIndex::ClassIndex(const Platform& platform)
    : lastParsed_(platform.plists),
      platform_{platform.log, platform.trace, lastParsed_, platform.resources, platform.clock} {}

ClassIndex::~ClassIndex() {
  platform_.trace.writeLine("Deallocing ClassIndex");
}

void ClassIndex::unbindSections() {
  for (const auto& decoder : decoders_) decoder->moveToSection({});
}

void ClassIndex::gatherInto(Readings* readings) {
  for (const auto& decoder : decoders_) decoder->gatherInto(readings);
}

void ClassIndex::status() const {
  platform_.log.print(LogPriority::warning, "Dictionary = %d", 1);
  platform_.log.print(LogPriority::warning, "String = %d", 0);
}

void ClassIndex::deallocWith(std::string_view line) {
  platform_.trace.writeLine(line);
  for (auto& decoder : decoders_) decoder.reset();
}

}  // namespace kelvasi
