// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ArrayLock.h"

namespace kelvasi {

// NOLINTBEGIN(cppcoreguidelines-avoid-non-const-global-variables): the one process-wide thing
std::recursive_mutex ArrayLock::lock_;
std::uint8_t ArrayLock::nesting_ = 0;
// NOLINTEND(cppcoreguidelines-avoid-non-const-global-variables)

void ArrayLock::lockArray() {
  lock_.lock();
  ++nesting_;
}

void ArrayLock::unlockArray() {
  --nesting_;
  if (nesting_ == 0) lock_.unlock();
}

}  // namespace kelvasi
