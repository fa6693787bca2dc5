// SPDX-License-Identifier: Apache-2.0
// Calls a user who looks elsewhere: a sound, a vibration where the machine has one, a notice of the desktop.
#pragma once

#include <string_view>

namespace kelvasi {

class Attention {
 public:
  virtual ~Attention() = default;

  // `title` and `text` are plain texts for people. A call takes the place of the notice of an earlier one of
  // the same `subject`. Never waits; where there is nobody to tell, nothing happens.
  virtual void call(std::string_view subject, std::string_view title, std::string_view text) = 0;
};

}  // namespace kelvasi
