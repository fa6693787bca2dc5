// SPDX-License-Identifier: Apache-2.0
// Values as JSON, for scripts.
#pragma once

#include <QJsonValue>

#include "Plist/PlistValue.h"

namespace kelvasi {

// Null for data, dates and nothing.
QJsonValue jsonOf(const PlistValue& value);

}  // namespace kelvasi
