// SPDX-License-Identifier: Apache-2.0
// Whether the desktop is light or dark, and when that changes.
#pragma once

#include <QDBusVariant>
#include <QObject>
#include <functional>

#include "Platform/QtWidgets/Palettes.h"

class QVariant;

namespace kelvasi {

// Asks the desktop portal (org.freedesktop.portal.Settings, color-scheme of org.freedesktop.appearance) over
// the session bus where there is one, without waiting for it. Until it answers, and where it does not, the
// palette of Qt's platform theme tells.
class SystemScheme : public QObject {
  Q_OBJECT

 public:
  using Changed = std::function<void(ColourScheme)>;

  // `changed` is called from the event loop.
  explicit SystemScheme(Changed changed);

  ColourScheme scheme() const { return scheme_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void askPortal();
  void takeFromPortal(const QVariant& value);
  void take(ColourScheme scheme);

 private slots:
  void portalSettingChanged(const QString& space, const QString& key, const QDBusVariant& value);

 private:
  Changed changed_;
  ColourScheme scheme_;
  bool isToldByPortal_ = false;
};

}  // namespace kelvasi
