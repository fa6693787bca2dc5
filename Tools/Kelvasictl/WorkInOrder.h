// SPDX-License-Identifier: Apache-2.0
// Pieces of work side by side, their results one after the other.
#pragma once

#include <cstddef>
#include <functional>

namespace kelvasi {

// Does the pieces 0 to `count` - 1 in up to `workers` threads, which are joined before it returns. `deliver`
// is called for each piece in order, in the caller's thread, as soon as it and all before it are done;
// workers get ahead of it by twice their number of pieces at most. With one worker all is done in the
// caller's thread. What either throws ends the work and is thrown on, of several pieces for the first.
void workInOrder(std::size_t count, std::size_t workers, const std::function<void(std::size_t piece)>& work,
                 const std::function<void(std::size_t piece)>& deliver);

}  // namespace kelvasi
