// SPDX-License-Identifier: Apache-2.0
// What a desktop starts and raises over the session bus (freedesktop.org's org.freedesktop.Application).
#pragma once

#include <QDBusVirtualObject>
#include <functional>

namespace kelvasi {

class DesktopActivation : private QDBusVirtualObject {
 public:
  // Takes the name of the application on the bus, where there is one and nobody has it, for as long as this
  // lives. `activate` is called from the event loop when the application is to come to the front.
  explicit DesktopActivation(std::function<void()> activate);
  ~DesktopActivation() override;

 private:
  QString introspect(const QString& path) const override;
  bool handleMessage(const QDBusMessage& message, const QDBusConnection& connection) override;

  std::function<void()> activate_;
};

}  // namespace kelvasi
