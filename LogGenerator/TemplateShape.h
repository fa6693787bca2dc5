// SPDX-License-Identifier: Apache-2.0
// Whether a display was made from a template.
#pragma once

#include "Plist/PlistValue.h"

namespace kelvasi {

// True when every dictionary and array of the template stands in the display under the same keys. What
// decoders added, and the elements of an array, which they replace, are not looked at.
bool hasShapeOf(const PlistValue& displayTemplate, const PlistValue& display);

}  // namespace kelvasi
