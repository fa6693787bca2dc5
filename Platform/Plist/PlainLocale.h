// SPDX-License-Identifier: Apache-2.0
// The "C" locale, for this thread and as long as the object lives: numbers are read and written as property
// lists have them, whatever the user's locale says of decimal commas.
#pragma once

#include <locale.h>  // NOLINT(modernize-deprecated-headers): for newlocale, which is POSIX and not C

namespace kelvasi {

class PlainLocale {
 public:
  PlainLocale() : plain_(newlocale(LC_ALL_MASK, "C", nullptr)), previous_(uselocale(plain_)) {}
  ~PlainLocale() {
    uselocale(previous_);
    if (plain_) freelocale(plain_);
  }
  PlainLocale(const PlainLocale&) = delete;
  PlainLocale& operator=(const PlainLocale&) = delete;

 private:
  locale_t plain_;
  locale_t previous_;
};

}  // namespace kelvasi
