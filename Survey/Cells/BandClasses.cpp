// SPDX-License-Identifier: Apache-2.0
#include "Survey/Cells/BandClasses.h"

namespace kelvasi::survey {

namespace {

// The first number of the quantity that stands in the section.
std::optional<std::int64_t> first(const Readings& readings, const Quantity& quantity,
                                  const ReadingSection* section) {
  for (const Reading& reading : readings.all()) {
    if (reading.section != section || quantityOf(reading) != &quantity) continue;
    if (const auto number = numberOf(reading)) return static_cast<std::int64_t>(*number);
  }
  return std::nullopt;
}

const ReadingSection* sectionWith(const Readings& readings, const Quantity& quantity) {
  for (const Reading& reading : readings.all()) {
    if (quantityOf(reading) == &quantity) return reading.section;
  }
  return nullptr;
}

}  // namespace

void BandClasses::take(const Readings& readings) {
  const ReadingSection* section = sectionWith(readings, quantity::bandClass);
  if (!section) return;
  const auto channel = first(readings, quantity::cdmaChannel, section);
  const auto bandClass = first(readings, quantity::bandClass, section);
  if (!channel || !bandClass) return;
  if (byChannel_.size() == mostChannels) byChannel_.clear();
  byChannel_[*channel] = *bandClass;
}

std::optional<std::int64_t> BandClasses::of(std::int64_t channel) const {
  const auto found = byChannel_.find(channel);
  return found == byChannel_.end() ? std::nullopt : std::optional(found->second);
}

}  // namespace kelvasi::survey
