// SPDX-License-Identifier: Apache-2.0
// Where a user's snapshots and what is remembered lie.
#pragma once

#include <filesystem>
#include <optional>
#include <string>

namespace kelvasi {

// kelvasi in $XDG_STATE_HOME or ~/.local/state; nothing when neither variable says where.
std::optional<std::filesystem::path> stateDirectory();

// Where snapshots go: $KELVASI_LOG_DIRECTORY; else the state directory, which is made. Throws
// std::runtime_error when none of the variables says where.
std::string makeLogDirectory();

}  // namespace kelvasi
