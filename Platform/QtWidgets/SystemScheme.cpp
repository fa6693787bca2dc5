// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/SystemScheme.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QEvent>
#include <QGuiApplication>
#include <utility>

#include "Platform/QtDesktop/SessionBus.h"

namespace kelvasi {

namespace {

const QString service = QStringLiteral("org.freedesktop.portal.Desktop");
const QString path = QStringLiteral("/org/freedesktop/portal/desktop");
const QString settings = QStringLiteral("org.freedesktop.portal.Settings");
const QString space = QStringLiteral("org.freedesktop.appearance");
const QString key = QStringLiteral("color-scheme");

constexpr unsigned noPreference = 0;
constexpr unsigned prefersDark = 1;

ColourScheme schemeOfPalette() {
  constexpr int middle = 128;
  return QGuiApplication::palette().color(QPalette::Window).lightness() < middle ? ColourScheme::dark
                                                                                 : ColourScheme::light;
}

// The portal wraps a setting once or twice.
QVariant unwrapped(QVariant value) {
  while (value.canConvert<QDBusVariant>()) value = value.value<QDBusVariant>().variant();
  return value;
}

}  // namespace

SystemScheme::SystemScheme(Changed changed) : changed_(std::move(changed)), scheme_(schemeOfPalette()) {
  qGuiApp->installEventFilter(this);
  QMetaObject::invokeMethod(
      this, [this] { askPortal(); }, Qt::QueuedConnection);
}

void SystemScheme::askPortal() {
  auto bus = sessionBus();
  if (!bus) return;
  qRegisterMetaType<QDBusVariant>();  // the bus finds no slot with a type that it has not met by its name
  bus->connect(service, path, settings, QStringLiteral("SettingChanged"), this,
               SLOT(portalSettingChanged(QString, QString, QDBusVariant)));
  auto question = QDBusMessage::createMethodCall(service, path, settings, QStringLiteral("Read"));
  question << space << key;
  auto* const answer = new QDBusPendingCallWatcher(bus->asyncCall(question), this);
  connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
    const QDBusPendingReply<QVariant> reply = *answer;
    if (reply.isValid()) takeFromPortal(unwrapped(reply.value()));
    answer->deleteLater();
  });
}

void SystemScheme::portalSettingChanged(const QString& changedSpace, const QString& changedKey,
                                        const QDBusVariant& value) {
  if (changedSpace == space && changedKey == key) takeFromPortal(unwrapped(value.variant()));
}

void SystemScheme::takeFromPortal(const QVariant& value) {
  const unsigned preference = value.toUInt();
  isToldByPortal_ = preference != noPreference;
  if (!isToldByPortal_) return take(schemeOfPalette());
  take(preference == prefersDark ? ColourScheme::dark : ColourScheme::light);
}

bool SystemScheme::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::ApplicationPaletteChange && !isToldByPortal_) take(schemeOfPalette());
  return QObject::eventFilter(watched, event);
}

void SystemScheme::take(ColourScheme scheme) {
  if (std::exchange(scheme_, scheme) != scheme) changed_(scheme);
}

}  // namespace kelvasi
