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

// A value of a document the guards have passed.
PlistValue fromLibplist(plist_t node);

// Null when the value, or one inside it, is absent or cannot be written; see LibplistSerialiser.h.
LibplistNode toLibplist(const PlistValue& value);

// The library's own calls keep dates as 32-bit seconds and lose the fraction of those before 2001; these do
// not.
PlistDate dateFromLibplist(plist_t node);
LibplistNode dateToLibplist(PlistDate date);

}  // namespace kelvasi
