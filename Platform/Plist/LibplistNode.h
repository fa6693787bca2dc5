// SPDX-License-Identifier: Apache-2.0
// The library's nodes, owned.
#pragma once

#include <plist/plist.h>

#include <cstdint>
#include <memory>
#include <span>
#include <type_traits>

#include "Plist/PlistValue.h"

namespace kelvasi {

struct LibplistNodeFree {
  void operator()(plist_t node) const { plist_free(node); }
};
using LibplistNode = std::unique_ptr<std::remove_pointer_t<plist_t>, LibplistNodeFree>;

// Null when the value, or one inside it, is absent or cannot be written; see LibplistSerialiser.h.
LibplistNode toLibplist(const PlistValue& value);

// The library's own call keeps a date as 32-bit seconds; this one does not.
LibplistNode dateToLibplist(PlistDate date);

}  // namespace kelvasi
