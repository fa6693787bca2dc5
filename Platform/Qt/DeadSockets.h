// SPDX-License-Identifier: Apache-2.0
// Sockets that processes left in the runtime directory when they were killed.
#pragma once

#include <sys/un.h>

namespace kelvasi {

class SystemLog;

// Removes the socket when nobody listens to it. False when somebody does, or the file is none. To be called
// with the directory locked: a socket between bind() and listen() looks dead.
bool removeIfDead(const sockaddr_un& address);

// Removes every dead socket of the runtime directory.
void removeDeadSockets(SystemLog& log);

}  // namespace kelvasi
