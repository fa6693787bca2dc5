// SPDX-License-Identifier: Apache-2.0
// A setting of the desktop, asked of its portal (org.freedesktop.portal.Settings) over the session bus where
// there is one, without waiting for it.
#pragma once

#include <QDBusVariant>
#include <QObject>
#include <QString>
#include <functional>

class QVariant;

namespace kelvasi {

class PortalSetting : public QObject {
  Q_OBJECT

 public:
  using Told = std::function<void(const QVariant& value)>;

  // `told` is called from the event loop, with the answer and with every change; never where nobody answers.
  PortalSetting(QString space, QString key, Told told);

 private:
  void ask();

 private slots:
  void settingChanged(const QString& space, const QString& key, const QDBusVariant& value);

 private:
  QString space_;
  QString key_;
  Told told_;
};

}  // namespace kelvasi
