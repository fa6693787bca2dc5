// SPDX-License-Identifier: Apache-2.0
// Blocks for screen readers: a list whose lines have names and values, of which changes are told.
#pragma once

namespace kelvasi {

// May be called more than once.
void installBlockAccess();

}  // namespace kelvasi
