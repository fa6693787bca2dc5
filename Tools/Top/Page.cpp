// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Page.h"

namespace kelvasi::top {

Lines ListPage::lines(int columns, int rowsOfPage, const Look& look) {
  Lines shown = head(columns, look);
  above_ = static_cast<int>(shown.size());
  Lines all = rows(columns, look);
  count_ = all.size();
  room_ = static_cast<std::size_t>(std::max(rowsOfPage - above_, 0));
  scroll_.fit(count_, room_);
  const std::size_t end = std::min(count_, scroll_.first + room_);
  for (std::size_t row = scroll_.first; row < end; ++row) {
    all[row].isSelected = row == scroll_.selected;
    shown.push_back(std::move(all[row]));
  }
  return shown;
}

bool ListPage::take(const Key& key) {
  if (scroll_.take(key, count_, room_)) return true;
  if (key.kind == Key::Kind::press) {
    const int row = key.place.row - above_;
    if (row < 0 || static_cast<std::size_t>(row) >= std::min(room_, count_)) return true;
    const std::size_t pressed = scroll_.first + static_cast<std::size_t>(row);
    if (std::exchange(scroll_.selected, pressed) == pressed) choose(pressed);
    return true;
  }
  if (key.kind != Key::Kind::enter || count_ == 0) return false;
  choose(scroll_.selected);
  return true;
}

}  // namespace kelvasi::top
