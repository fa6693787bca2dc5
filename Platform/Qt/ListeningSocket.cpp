// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/ListeningSocket.h"

#include <sys/socket.h>
#include <sys/stat.h>

#include <QSocketNotifier>
#include <QTimer>
#include <cerrno>
#include <cstring>

#include "Platform/Qt/DeadSockets.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr int connectionsInQueue = 64;
constexpr auto pauseAfterFailure = 1000ms;  // of accept(), such as too many open files

const sockaddr* generic(const sockaddr_un& address) {
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): what the calls take
  return reinterpret_cast<const sockaddr*>(&address);
}

}  // namespace

std::unique_ptr<ListeningSocket> ListeningSocket::open(std::string_view name, SystemLog& log,
                                                       ConnectionHandler handler) {
  auto directory = RuntimeDirectory::open(log);
  const auto address = directory ? directory->addressToListen(name, log) : std::nullopt;
  if (!address) return nullptr;
  std::unique_ptr<ListeningSocket> opened(
      new ListeningSocket(std::move(*directory), name, *address, log, std::move(handler)));
  return opened->listen() ? std::move(opened) : nullptr;
}

ListeningSocket::ListeningSocket(RuntimeDirectory directory, std::string_view name,
                                 const sockaddr_un& address, SystemLog& log, ConnectionHandler handler)
    : directory_(std::move(directory)),
      name_(name),
      address_(address),
      log_(log),
      handler_(std::make_shared<const ConnectionHandler>(std::move(handler))),
      socket_(::socket(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0)) {}

ListeningSocket::~ListeningSocket() {
  if (inode_ == 0) return;
  if (const FileDescriptor lock = directory_.lock(log_); lock && isOwnFile()) ::unlink(address_.sun_path);
}

bool ListeningSocket::listen() {
  const FileDescriptor lock = directory_.lock(log_);
  if (!lock) return false;
  int error = socket_ ? bindToName() : errno;
  if (error == EADDRINUSE && removeIfDead(address_)) error = bindToName();
  if (error == 0 && ::listen(socket_.number(), connectionsInQueue) != 0) error = errno;
  if (error != 0) {
    log_.print(LogPriority::error, "%s: cannot listen: %s", address_.sun_path, std::strerror(error));
    return false;
  }
  watch();
  return true;
}

// Returns 0 or errno.
int ListeningSocket::bindToName() {
  struct stat made {};
  if (::bind(socket_.number(), generic(address_), sizeof address_) != 0) return errno;
  if (::lstat(address_.sun_path, &made) != 0) return errno;
  device_ = made.st_dev;
  inode_ = made.st_ino;
  return directory_.admitCallers(address_);
}

void ListeningSocket::watch() {
  notifier_ = std::make_unique<QSocketNotifier>(socket_.number(), QSocketNotifier::Read);
  QObject::connect(notifier_.get(), &QSocketNotifier::activated, [this]() noexcept { acceptOne(); });
  pause_ = std::make_unique<QTimer>();
  pause_->setSingleShot(true);
  QObject::connect(pause_.get(), &QTimer::timeout, [this] { notifier_->setEnabled(true); });
}

void ListeningSocket::acceptOne() {
  FileDescriptor socket(::accept4(socket_.number(), nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC));
  if (!socket) {
    if (errno == EAGAIN || errno == EINTR || errno == ECONNABORTED) return;
    log_.print(LogPriority::error, "%s: cannot accept: %s", address_.sun_path, std::strerror(errno));
    notifier_->setEnabled(false);
    pause_->start(pauseAfterFailure);
    return;
  }
  if (!isPeerAllowed(socket.number(), directory_.allowedCallers(), name_, log_)) return;
  const auto handler = handler_;  // outlives this object, which the handler may destroy
  (*handler)(std::move(socket));
}

bool ListeningSocket::isOwnFile() const {
  struct stat found {};
  return ::lstat(address_.sun_path, &found) == 0 && found.st_dev == device_ && found.st_ino == inode_;
}

}  // namespace kelvasi
