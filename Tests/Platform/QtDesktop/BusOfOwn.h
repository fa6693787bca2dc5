// SPDX-License-Identifier: Apache-2.0
// A session bus of the tests' own.
#pragma once

#include <QString>

namespace kelvasi::testing {

// The address of the bus, which is the session's from the first call on, as Qt connects to one only in a
// process. Empty where there is no dbus-daemon.
QString busOfOwn();

}  // namespace kelvasi::testing
