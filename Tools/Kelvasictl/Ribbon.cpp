// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Ribbon.h"

#include <algorithm>

namespace kelvasi {

void Ribbon::take(const cockpit::Snapshot& face, Arrival upcoming) {
  next_ = std::max(face.time + interval_, upcoming);
  const auto& levels = face.serving.levels;
  if (levels.empty() || !levels.front().value || levels.front().age.fade == cockpit::Fade::gone) return;
  level_ = levels.front().name;
  values_.push_back({face.time, static_cast<float>(*levels.front().value)});
  if (values_.size() <= most) return;
  interval_ *= 2;
  std::size_t kept = 0;
  for (std::size_t at = 0; at < values_.size(); at += 2) values_[kept++] = values_[at];
  values_.resize(kept);
}

std::vector<survey::Spread> Ribbon::stretches(Arrival from, Arrival to, std::size_t count) const {
  std::vector<survey::Spread> spreads(count);
  if (count == 0 || to <= from) return spreads;
  const auto length = static_cast<double>((to - from).count());
  for (const Value& value : values_) {
    const double place =
        static_cast<double>((value.time - from).count()) / length * static_cast<double>(count);
    const auto at = std::clamp(place, 0.0, static_cast<double>(count - 1));
    spreads[static_cast<std::size_t>(at)].add(survey::Spread::of(value.value));
  }
  return spreads;
}

}  // namespace kelvasi
