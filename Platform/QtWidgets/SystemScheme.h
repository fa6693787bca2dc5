// SPDX-License-Identifier: Apache-2.0
// Whether the desktop is light or dark, and when that changes.
#pragma once

#include <QObject>
#include <functional>

#include "Platform/QtWidgets/Palettes.h"
#include "Platform/QtWidgets/PortalSetting.h"

namespace kelvasi {

// The desktop portal's color-scheme of org.freedesktop.appearance. Until it answers, and where it does not,
// the palette of Qt's platform theme tells.
class SystemScheme : public QObject {
 public:
  using Changed = std::function<void(ColourScheme)>;

  // `changed` is called from the event loop.
  explicit SystemScheme(Changed changed);

  ColourScheme scheme() const { return scheme_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void takeFromPortal(const QVariant& value);
  void take(ColourScheme scheme);

  Changed changed_;
  ColourScheme scheme_;
  bool isToldByPortal_ = false;
  PortalSetting portal_;
};

}  // namespace kelvasi
