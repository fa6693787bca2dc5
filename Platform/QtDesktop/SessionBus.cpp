// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/SessionBus.h"

#include <QFileInfo>
#include <QString>

namespace kelvasi {

std::optional<QDBusConnection> sessionBus() {
  const bool isNamed = !qEnvironmentVariableIsEmpty("DBUS_SESSION_BUS_ADDRESS");
  const QString usual = qEnvironmentVariable("XDG_RUNTIME_DIR") + QStringLiteral("/bus");
  if (!isNamed && !QFileInfo::exists(usual)) return std::nullopt;
  const QDBusConnection bus = QDBusConnection::sessionBus();
  return bus.isConnected() ? std::optional(bus) : std::nullopt;
}

}  // namespace kelvasi
