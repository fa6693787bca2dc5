// SPDX-License-Identifier: Apache-2.0
// The plain socket side of a test: a peer whose bytes the test types itself.
#pragma once

#include <cstddef>
#include <string>

#include "Platform/Posix/FileDescriptor.h"
#include "Plist/PlistValue.h"

namespace kelvasi::test {

// One connection; throws std::runtime_error when a call fails.
class RawSocket {
 public:
  explicit RawSocket(FileDescriptor socket) : socket_(std::move(socket)) {}
  static RawSocket connectTo(const std::string& path);

  // All of it, waiting as long as it takes. False when the peer has gone.
  bool write(const Bytes& bytes);
  // As many bytes, or fewer when the peer closes.
  Bytes read(std::size_t count);
  // Everything until the peer closes.
  Bytes readToEnd();
  // Whether the peer has read all that was written.
  bool isTaken() const;
  void close() { socket_.close(); }

 private:
  FileDescriptor socket_;
};

class RawListener {
 public:
  explicit RawListener(const std::string& path, int queue = 8);
  RawSocket accept();

 private:
  FileDescriptor socket_;
};

// A frame's header typed out, then the data. The length is that of the data unless one is given.
Bytes frame(int kind, std::uint32_t id, std::uint32_t token, const Bytes& data);
Bytes header(std::uint32_t length, int kind, std::uint32_t id, std::uint32_t token);

}  // namespace kelvasi::test
