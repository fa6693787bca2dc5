// SPDX-License-Identifier: Apache-2.0
// Which readings of a run are wanted.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "LogGenerator/Readings.h"
#include "Tools/OptionSet.h"

namespace kelvasi {

class ReadingChoice {
 public:
  void addTo(OptionSet verb);

  // Of messages before `from` and after `to` none is.
  bool takesMessageAt(Arrival arrival) const {
    return (!from_ || arrival >= *from_) && (!to_ || arrival <= *to_);
  }
  bool takes(const Reading& reading, const std::string& path) const;

 private:
  std::vector<std::string> globs_;
  std::optional<Arrival> from_;
  std::optional<Arrival> to_;
};

// "2024-03-05T14:07:09.25Z" (RFC 3339, with any offset), or seconds since 1970 UTC, as "1709647629.25".
// Nothing for another text.
std::optional<Arrival> momentOf(const std::string& text);

}  // namespace kelvasi
