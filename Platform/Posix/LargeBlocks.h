// SPDX-License-Identifier: Apache-2.0
// How the process keeps the memory of large, short-lived blocks.
#pragma once

namespace kelvasi {

// From now on blocks of 256 KiB and more have pages of their own, which go back to the system when they are
// freed. glibc would raise that limit with every such block until the heap holds them all, and a freed one
// would stay.
void keepLargeBlocksApart();

}  // namespace kelvasi
