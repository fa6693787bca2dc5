// SPDX-License-Identifier: Apache-2.0
// Roles, names and actions of this toolkit's own widgets, for screen readers.
#pragma once

namespace kelvasi {

// From now on; does nothing the second time.
void installAccessibility();

}  // namespace kelvasi
