// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/LargeBlocks.h"

#include <malloc.h>

namespace kelvasi {

void keepLargeBlocksApart() {
  constexpr int limit = 256 * 1024;
  mallopt(M_MMAP_THRESHOLD, limit);
}

}  // namespace kelvasi
