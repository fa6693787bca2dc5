// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtMessagePorts.h"

#include <QUuid>

#include "Platform/Qt/QtLocalPort.h"
#include "Platform/Qt/QtRemotePort.h"
#include "Platform/Qt/UnixSocket.h"

namespace kelvasi {

std::unique_ptr<LocalPort> QtMessagePorts::createLocalPort(std::string_view name,
                                                           LocalPort::ReceiveHandler handler) {
  return QtLocalPort::open(name, log_, std::move(handler));
}

std::unique_ptr<RemotePort> QtMessagePorts::createRemotePort(std::string_view name) {
  FileDescriptor socket = connectToName(name, log_);
  return socket ? std::make_unique<QtRemotePort>(std::move(socket), std::string(name), log_) : nullptr;
}

std::optional<std::string> QtMessagePorts::makeUniqueIdentifier() {
  const QUuid identifier = QUuid::createUuid();
  if (identifier.isNull()) return std::nullopt;
  return identifier.toString(QUuid::WithoutBraces).toStdString();
}

}  // namespace kelvasi
