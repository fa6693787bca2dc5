// SPDX-License-Identifier: Apache-2.0
// The user's D-Bus session bus.
#pragma once

#include <QDBusConnection>
#include <optional>

namespace kelvasi {

// Nothing where no bus is running; never starts one.
std::optional<QDBusConnection> sessionBus();

}  // namespace kelvasi
