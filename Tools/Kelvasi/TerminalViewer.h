// SPDX-License-Identifier: Apache-2.0
// The viewer without a window.
#pragma once

#include <string>

namespace kelvasi {

// The process becomes the `kelvasictl top` that lies beside this program. Returns only where that fails, with
// what is wrong, for people.
std::string becomeTerminalViewer(bool logsToStderr);

}  // namespace kelvasi
