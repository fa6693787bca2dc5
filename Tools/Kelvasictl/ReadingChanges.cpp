// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingChanges.h"

#include <algorithm>
#include <map>

namespace kelvasi {

namespace {

// The path of the list that the reading is part of, the display itself where that was removed; nothing for a
// row that stands for itself.
std::optional<std::string> listOf(const ReadingText& each, bool isAllNew) {
  if (isAllNew) return "";
  const Reading& reading = *each.reading;
  if (reading.entry != Reading::notInList) return reading.section->path;
  if (reading.list.empty() && reading.keyKind != Reading::Key::path) return std::nullopt;
  std::string path = reading.section->path;
  if (reading.keyKind != Reading::Key::path) {
    appendPathStep(path, reading.list);
  } else {
    path += reading.key.substr(0, reading.key.find('/', 1));
  }
  return path;
}

}  // namespace

std::vector<ReadingText> ReadingChanges::of(std::vector<ReadingText> message) {
  const bool isAllNew = !message.empty() && !message.front().reading->section;
  std::vector<bool> changes(message.size());
  std::map<std::string, std::vector<std::size_t>> lists;
  for (std::size_t at = 0; at < message.size(); ++at) {
    if (const auto list = listOf(message[at], isAllNew)) {
      lists[*list].push_back(at);
    } else {
      changes[at] = isChange(message[at]);
    }
  }
  for (const auto& [list, places] : lists) {
    rows_.erase(list);
    markList(lists_[list], message, places, changes);
  }
  std::vector<ReadingText> changed;
  for (std::size_t at = 0; at < message.size(); ++at) {
    if (changes[at]) changed.push_back(std::move(message[at]));
  }
  return changed;
}

bool ReadingChanges::isChange(const ReadingText& row) {
  lists_.erase(row.path);  // the row takes its place
  if (!row.text) return rows_.erase(row.path) != 0;
  Shown shown{row.path, *row.text, quantityOf(*row.reading)};
  const auto [standing, isNew] = rows_.try_emplace(row.path, shown);
  if (!isNew && standing->second == shown) return false;
  standing->second = std::move(shown);
  return true;
}

void ReadingChanges::markList(std::vector<Shown>& standing, const std::vector<ReadingText>& message,
                              const std::vector<std::size_t>& places, std::vector<bool>& changes) {
  std::vector<Shown> written;
  for (const std::size_t at : places) {
    if (message[at].text)
      written.push_back({message[at].path, *message[at].text, quantityOf(*message[at].reading)});
  }
  const bool hasSameRows = std::ranges::equal(written, standing, {}, &Shown::path, &Shown::path);
  std::size_t row = 0;
  for (const std::size_t at : places) {
    changes[at] = !hasSameRows;
    if (hasSameRows && message[at].text) {
      changes[at] = !(written[row] == standing[row]);
      ++row;
    }
  }
  standing = std::move(written);
}

}  // namespace kelvasi
