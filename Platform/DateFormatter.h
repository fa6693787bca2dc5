// SPDX-License-Identifier: Apache-2.0
// Dates as texts for the user, in the current locale and time zone.
#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

class DateFormatter {
 public:
  virtual ~DateFormatter() = default;
  virtual std::string stringFromDate(PlistDate date) const = 0;
};

class DateFormatters {
 public:
  virtual ~DateFormatters() = default;
  // Of a Unicode date pattern (UTS #35) made of quoted literals, yyyy, MM, dd, HH, mm and ss.
  virtual std::unique_ptr<DateFormatter> makeDateFormatter(std::string_view pattern) const = 0;
};

}  // namespace kelvasi
