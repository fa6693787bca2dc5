// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/BuildTime.h"

namespace kelvasi {

const char* compiledAt() {
  return __DATE__ " " __TIME__;
}

}  // namespace kelvasi
