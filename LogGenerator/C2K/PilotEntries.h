// SPDX-License-Identifier: Apache-2.0
// A record that ends in a list of pilots, an entry of one size for each.
#pragma once

#include "LogGenerator/C2K/C2KUpdate.h"

namespace kelvasi {

struct PilotEntries {
  RadioFamily family;
  std::size_t first;  // where the first entry starts, in bytes of the record
  std::size_t size;   // of an entry
  std::span<const Field> layout;
  Field pilot;                 // the PN offset
  const Row& row;              // what is shown of an entry; lasts as long as the process
  bool leavesOutNone = false;  // entries without a pilot

  std::size_t lengthOf(std::size_t count) const { return first + size * count; }
  void show(const C2KUpdate& update, std::size_t count) const;
};

}  // namespace kelvasi
