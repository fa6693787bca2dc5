// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/Qt/RawSocket.h"

#include <linux/sockios.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <sys/un.h>

#include <algorithm>
#include <stdexcept>

namespace kelvasi::test {

namespace {

sockaddr_un addressOf(const std::string& path) {
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  if (path.size() >= sizeof address.sun_path) throw std::runtime_error("path too long");
  std::ranges::copy(path, address.sun_path);
  return address;
}

FileDescriptor makeSocket() {
  return FileDescriptor(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
}

void check(bool isGood, const char* what) {
  if (!isGood) throw std::runtime_error(what);
}

}  // namespace

RawSocket RawSocket::connectTo(const std::string& path) {
  FileDescriptor socket = makeSocket();
  const sockaddr_un address = addressOf(path);
  check(::connect(socket.number(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0,
        "connect");
  return RawSocket(std::move(socket));
}

bool RawSocket::write(const Bytes& bytes) {
  std::size_t sent = 0;
  while (sent < bytes.size()) {
    const ssize_t count = ::send(socket_.number(), bytes.data() + sent, bytes.size() - sent, MSG_NOSIGNAL);
    if (count <= 0) return false;
    sent += static_cast<std::size_t>(count);
  }
  return true;
}

Bytes RawSocket::read(std::size_t count) {
  Bytes bytes(count);
  std::size_t held = 0;
  while (held < count) {
    const ssize_t got = ::recv(socket_.number(), bytes.data() + held, count - held, 0);
    if (got <= 0) break;
    held += static_cast<std::size_t>(got);
  }
  bytes.resize(held);
  return bytes;
}

Bytes RawSocket::readToEnd() {
  Bytes all;
  while (true) {
    const Bytes some = read(std::size_t{64} << 10);
    if (some.empty()) return all;
    all.insert(all.end(), some.begin(), some.end());
  }
}

bool RawSocket::isTaken() const {
  int unread = 0;
  check(::ioctl(socket_.number(), SIOCOUTQ, &unread) == 0, "ioctl");
  return unread == 0;
}

RawListener::RawListener(const std::string& path, int queue) : socket_(makeSocket()) {
  const sockaddr_un address = addressOf(path);
  check(::bind(socket_.number(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0, "bind");
  check(::listen(socket_.number(), queue) == 0, "listen");
}

RawSocket RawListener::accept() {
  return RawSocket(FileDescriptor(::accept4(socket_.number(), nullptr, nullptr, SOCK_CLOEXEC)));
}

Bytes header(std::uint32_t length, int kind, std::uint32_t id, std::uint32_t token) {
  Bytes bytes;
  const auto put = [&bytes](std::uint32_t value) {
    for (unsigned shift = 0; shift < 32; shift += 8)
      bytes.push_back(static_cast<std::uint8_t>(value >> shift & 0xFF));
  };
  put(length);
  bytes.insert(bytes.end(), {1, static_cast<std::uint8_t>(kind), 0, 0});
  put(id);
  put(token);
  return bytes;
}

Bytes frame(int kind, std::uint32_t id, std::uint32_t token, const Bytes& data) {
  Bytes bytes = header(static_cast<std::uint32_t>(data.size()), kind, id, token);
  bytes.insert(bytes.end(), data.begin(), data.end());
  return bytes;
}

}  // namespace kelvasi::test
