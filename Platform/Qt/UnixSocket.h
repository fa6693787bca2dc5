// SPDX-License-Identifier: Apache-2.0
// Connecting to a named socket of the runtime directory.
#pragma once

#include <chrono>
#include <string_view>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Qt/RuntimeDirectory.h"

namespace kelvasi {

// Longest wait for a listener whose queue of connections is full.
inline constexpr std::chrono::milliseconds connectTimeout{1000};

// A stream socket, closed on exec; an empty descriptor when there is none to be had.
FileDescriptor makeUnixSocket();

// 0, or the errno of the failure: ECONNREFUSED and ENOENT when nobody listens, ETIMEDOUT when the listener
// took no connection in time.
int connectWithin(const FileDescriptor& socket, const sockaddr_un& address,
                  std::chrono::milliseconds timeout);

// A connected, non-blocking socket to the name's listener, whose user was checked. Otherwise an empty
// descriptor; an error line unless the reason is merely that nobody listens.
FileDescriptor connectToName(std::string_view name, SystemLog& log);

}  // namespace kelvasi
