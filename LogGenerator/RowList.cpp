#include "LogGenerator/RowList.h"

namespace kelvasi {

RowWriter RowList::add() {
  const std::size_t place = entries_.size();
  if (place == pool_.size()) pool_.emplace_back();
  PlistValue::Dictionary& entry = pool_[place];
  if (entry.use_count() != 1) entry = std::make_shared<PlistDictionary>();
  entries_.append(entry);
  return RowWriter(*entry, Rows::anew);
}

void RowList::startAgain() {
  entries_.removeAll();
}

}  // namespace kelvasi
