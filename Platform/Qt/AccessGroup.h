// SPDX-License-Identifier: Apache-2.0
// The group whose users may meet, where TELVON_GROUP names one. Otherwise only one user's processes do.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>

namespace kelvasi {

struct AccessGroup {
  std::optional<gid_t> id;  // nothing where the variable is not set, or empty
  std::string fault;        // of the variable; empty when there is none

  // By name or by number. A group that is not there, or that this process is not in, is a fault.
  static AccessGroup ofEnvironment();
};

// Whether the process at the other end of a Unix-domain socket is in the group, also by a supplementary one.
bool isPeerInGroup(int socket, gid_t group);

}  // namespace kelvasi
