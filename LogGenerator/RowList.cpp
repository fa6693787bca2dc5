// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RowList.h"

namespace kelvasi {

RowWriter RowList::add() {
  const std::size_t place = entries_.size();
  if (place == pool_.size()) pool_.emplace_back();
  PlistValue::Dictionary& entry = pool_[place];
  if (entry.use_count() != 1) entry = std::make_shared<PlistDictionary>();
  entries_.append(entry);
  ReadingPlace own = place_;
  (own.list.empty() ? own.entry : own.element) = static_cast<std::int32_t>(place);
  return RowWriter(*entry, own, Rows::anew);
}

void RowList::startAgain(const ReadingPlace& place) {
  place_ = place;
  entries_.removeAll();
}

}  // namespace kelvasi
