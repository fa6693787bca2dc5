// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/DesktopActivation.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <utility>

#include "Platform/QtDesktop/SessionBus.h"

namespace kelvasi {

namespace {

constexpr QLatin1String name("org.kelvasi.Kelvasi");
constexpr QLatin1String path("/org/kelvasi/Kelvasi");
constexpr QLatin1String interface("org.freedesktop.Application");

// What else the interface has, files and actions, the application does not offer.
bool isActivation(const QDBusMessage& message) {
  return message.member() == QLatin1String("Activate") && message.signature() == QLatin1String("a{sv}");
}

}  // namespace

DesktopActivation::DesktopActivation(std::function<void()> activate) : activate_(std::move(activate)) {
  auto bus = sessionBus();
  if (!bus) return;
  // The object first: who waits for the name calls at once.
  bus->registerVirtualObject(path, this);
  bus->registerService(name);
}

DesktopActivation::~DesktopActivation() {
  auto bus = sessionBus();
  if (!bus) return;
  bus->unregisterService(name);
  bus->unregisterObject(path);
}

QString DesktopActivation::introspect(const QString&) const {
  return QStringLiteral(R"(<interface name="org.freedesktop.Application">
  <method name="Activate"><arg type="a{sv}" name="platform_data" direction="in"/></method>
</interface>
)");
}

bool DesktopActivation::handleMessage(const QDBusMessage& message, const QDBusConnection& connection) {
  if (message.interface() != interface) return false;
  if (!isActivation(message)) {
    connection.send(message.createErrorReply(QDBusError::UnknownMethod, message.member()));
    return true;
  }
  connection.send(message.createReply());
  activate_();
  return true;
}

}  // namespace kelvasi
