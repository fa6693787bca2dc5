// SPDX-License-Identifier: Apache-2.0
// A socket under a name of the runtime directory, and those who connect to it.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <string_view>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Qt/RuntimeDirectory.h"

class QSocketNotifier;
class QTimer;

namespace kelvasi {

// Destroying it removes the socket from the directory.
class ListeningSocket {
 public:
  // Given a connected, non-blocking socket whose peer's user was checked.
  using ConnectionHandler = std::function<void(FileDescriptor socket)>;

  // Null, and one error line, when the name is not usable or somebody listens under it. A socket that was
  // left behind by a dead process is replaced. The handler runs from the event loop and may destroy this
  // object.
  static std::unique_ptr<ListeningSocket> open(std::string_view name, SystemLog& log,
                                               ConnectionHandler handler);
  ~ListeningSocket();
  ListeningSocket(const ListeningSocket&) = delete;
  ListeningSocket& operator=(const ListeningSocket&) = delete;

 private:
  ListeningSocket(RuntimeDirectory directory, std::string_view name, const sockaddr_un& address,
                  SystemLog& log, ConnectionHandler handler);
  bool listen();
  int bindToName();
  void watch();
  void acceptOne();
  bool isOwnFile() const;

  RuntimeDirectory directory_;
  std::string name_;
  sockaddr_un address_;
  SystemLog& log_;
  std::shared_ptr<const ConnectionHandler> handler_;
  FileDescriptor socket_;
  dev_t device_ = 0;  // the file that bind() made
  ino_t inode_ = 0;
  std::unique_ptr<QSocketNotifier> notifier_;
  std::unique_ptr<QTimer> pause_;  // after accept() failed
};

}  // namespace kelvasi
