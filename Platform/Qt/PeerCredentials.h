// SPDX-License-Identifier: Apache-2.0
// Who is at the other end of a Unix-domain socket.
#pragma once

#include <string_view>

namespace kelvasi {

class SystemLog;

// Whether the peer runs under this process's effective user; an error line with `name` says so when it does
// not, or cannot be told.
bool isPeerOfThisUser(int socket, std::string_view name, SystemLog& log);

}  // namespace kelvasi
