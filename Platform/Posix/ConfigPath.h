// SPDX-License-Identifier: Apache-2.0
// Where a user's own settings lie.
#pragma once

#include <filesystem>
#include <optional>
#include <string_view>

namespace kelvasi {

// kelvasi/NAME in $XDG_CONFIG_HOME, or in ~/.config where that is not set or no absolute path (XDG Base
// Directories). Whether it is there is another matter; nothing when the environment says nowhere.
std::optional<std::filesystem::path> configPath(std::string_view name);

}  // namespace kelvasi
