// SPDX-License-Identifier: Apache-2.0
// Which band class a CDMA channel is in, as far as records say so: the number of the channel alone does not
// tell.
#pragma once

#include <cstdint>
#include <map>
#include <optional>

#include "LogGenerator/Readings.h"

namespace kelvasi::survey {

class BandClasses {
 public:
  void take(const Readings& readings);
  // What was said last.
  std::optional<std::int64_t> of(std::int64_t channel) const;

 private:
  static constexpr std::size_t mostChannels = 256;

  std::map<std::int64_t, std::int64_t> byChannel_;
};

}  // namespace kelvasi::survey
