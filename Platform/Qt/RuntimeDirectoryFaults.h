// SPDX-License-Identifier: Apache-2.0
// Where the runtime directory is, how it is made, and what makes it or a port's name unusable.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

namespace kelvasi {

// In a group's directory: where others than its owner listen. All of the group may add to it, and take away
// what is theirs.
inline constexpr const char* guestRoomName = "applications";

// Without slashes at its end; empty when no variable says where.
std::string runtimePathFromEnvironment();

// Makes the directory when it is not there; that of a group, and the room in it, only for a daemon. Returns
// why it cannot be trusted; empty when it can.
std::string makeAndCheck(const std::string& path, const std::optional<gid_t>& group, bool isDaemon);

// Null when there is none.
const char* faultOfPortName(std::string_view name);
// For a line of the log.
std::string printablePortName(std::string_view name);

}  // namespace kelvasi
