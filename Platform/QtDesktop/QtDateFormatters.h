// SPDX-License-Identifier: Apache-2.0
// Dates in the user's locale and time zone.
#pragma once

#include "Platform/DateFormatter.h"

namespace kelvasi {

class QtDateFormatters : public DateFormatters {
 public:
  std::unique_ptr<DateFormatter> makeDateFormatter(std::string_view pattern) const override;
};

}  // namespace kelvasi
