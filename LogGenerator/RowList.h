// SPDX-License-Identifier: Apache-2.0
// The entries of a list section while they are built. The dictionaries are used again from record to record,
// as long as nobody else holds them, so that a list whose length does not change costs no allocation.
#pragma once

#include <cstddef>
#include <vector>

#include "LogGenerator/RowWriter.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class RowList {
 public:
  // The next entry; it holds what is written through the result. One entry is written at a time.
  RowWriter add();
  // `place` is the list's own.
  void startAgain(const ReadingPlace& place);

  const PlistArray& entries() const { return entries_; }

 private:
  std::vector<PlistValue::Dictionary> pool_;
  PlistArray entries_;
  ReadingPlace place_;
};

}  // namespace kelvasi
