// A list of pilots as the display shows it: sorted, keyed by the place in the record and the PN offset.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "LogGenerator/C2K/FormattedText.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class PilotList {
 public:
  void add(std::size_t place, std::int64_t pilot, std::string_view text) {
    pilots_->set(FormattedText("%d;%d", static_cast<int>(place), static_cast<int>(pilot)), text);
  }
  // The list itself, even when it is empty.
  PlistValue list() const { return pilots_; }
  PlistValue listOrNone() const { return pilots_->size() > 1 ? list() : PlistValue("(none)"); }

 private:
  PlistValue::Dictionary pilots_ = PlistDictionary::make({{"_sorted", "_sorted"}});
};

}  // namespace kelvasi
