// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/PortalSetting.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <utility>

#include "Platform/QtDesktop/SessionBus.h"

namespace kelvasi {

namespace {

const QString service = QStringLiteral("org.freedesktop.portal.Desktop");
const QString path = QStringLiteral("/org/freedesktop/portal/desktop");
const QString settings = QStringLiteral("org.freedesktop.portal.Settings");

// The portal wraps a setting once or twice.
QVariant unwrapped(QVariant value) {
  while (value.canConvert<QDBusVariant>()) value = value.value<QDBusVariant>().variant();
  return value;
}

}  // namespace

PortalSetting::PortalSetting(QString space, QString key, Told told)
    : space_(std::move(space)), key_(std::move(key)), told_(std::move(told)) {
  QMetaObject::invokeMethod(
      this, [this] { ask(); }, Qt::QueuedConnection);
}

void PortalSetting::ask() {
  auto bus = sessionBus();
  if (!bus) return;
  qRegisterMetaType<QDBusVariant>();  // the bus finds no slot with a type that it has not met by its name
  bus->connect(service, path, settings, QStringLiteral("SettingChanged"), this,
               SLOT(settingChanged(QString, QString, QDBusVariant)));
  auto question = QDBusMessage::createMethodCall(service, path, settings, QStringLiteral("Read"));
  question << space_ << key_;
  auto* const answer = new QDBusPendingCallWatcher(bus->asyncCall(question), this);
  connect(answer, &QDBusPendingCallWatcher::finished, this, [this, answer] {
    const QDBusPendingReply<QVariant> reply = *answer;
    if (reply.isValid()) told_(unwrapped(reply.value()));
    answer->deleteLater();
  });
}

void PortalSetting::settingChanged(const QString& space, const QString& key, const QDBusVariant& value) {
  if (space == space_ && key == key_) told_(unwrapped(value.variant()));
}

}  // namespace kelvasi
