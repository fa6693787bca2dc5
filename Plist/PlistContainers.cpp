// SPDX-License-Identifier: Apache-2.0
#include "Plist/PlistContainers.h"

#include <algorithm>

namespace kelvasi {

namespace {
constexpr std::size_t indexedFrom = 24;  // below this a linear search is the faster one
}

PlistDictionary::PlistDictionary(std::initializer_list<Entry> entries) {
  for (const Entry& entry : entries) set(entry.first, entry.second);
}

PlistValue::Dictionary PlistDictionary::make(std::initializer_list<Entry> entries) {
  return std::make_shared<PlistDictionary>(entries);
}

const PlistValue* PlistDictionary::find(std::string_view key) const {
  const std::size_t place = placeOf(key);
  return place == size() ? nullptr : &entries_[place].second;
}

PlistValue PlistDictionary::get(std::string_view key) const {
  const PlistValue* value = find(key);
  return value ? *value : PlistValue();
}

void PlistDictionary::set(std::string_view key, PlistValue value) {
  if (value.isAbsent()) {
    remove(key);
    return;
  }
  const std::size_t place = placeOf(key);
  if (place == size()) {
    append(key, std::move(value));
  } else {
    entries_[place].second = std::move(value);
  }
}

bool PlistDictionary::remove(std::string_view key) {
  const std::size_t place = placeOf(key);
  if (place == size()) return false;
  entries_.erase(entries_.begin() + static_cast<std::ptrdiff_t>(place));
  rebuildIndex();
  return true;
}

void PlistDictionary::removeAll() {
  truncate(0);
}

template <typename Text>
std::size_t PlistDictionary::setAnyText(std::string_view key, Text text, std::size_t place) {
  if (place >= size() || std::string_view(entries_[place].first) != key) place = placeOf(key);
  if (place == size()) return append(key, text);
  entries_[place].second.set(text);
  return place + 1;
}

template <typename Text>
std::size_t PlistDictionary::rewriteAnyText(std::string_view key, Text text, std::size_t place) {
  if (place < size() && std::string_view(entries_[place].first) != key) truncate(place);
  return setAnyText(key, text, place);
}

std::size_t PlistDictionary::setText(std::string_view key, std::string_view text, std::size_t place) {
  return setAnyText(key, text, place);
}

std::size_t PlistDictionary::setText(std::string_view key, DeferredText text, std::size_t place) {
  return setAnyText(key, text, place);
}

std::size_t PlistDictionary::rewriteText(std::string_view key, std::string_view text, std::size_t place) {
  return rewriteAnyText(key, text, place);
}

std::size_t PlistDictionary::rewriteText(std::string_view key, DeferredText text, std::size_t place) {
  return rewriteAnyText(key, text, place);
}

PlistValue& PlistDictionary::rewrite(std::string_view key, std::size_t& place) {
  if (place < size() && entries_[place].first == key) return entries_[place++].second;
  truncate(place);
  const std::size_t before = placeOf(key);
  if (before < size()) return entries_[before].second;
  place = append(key, {});
  return entries_.back().second;
}

void PlistDictionary::truncate(std::size_t place) {
  if (place >= size()) return;
  entries_.erase(entries_.begin() + static_cast<std::ptrdiff_t>(place), entries_.end());
  rebuildIndex();
}

std::size_t PlistDictionary::placeOf(std::string_view key) const {
  if (!index_.empty()) {
    const auto found = index_.find(key);
    return found == index_.end() ? size() : found->second;
  }
  const auto found = std::ranges::find(entries_, key, &Entry::first);
  return static_cast<std::size_t>(found - entries_.begin());
}

std::size_t PlistDictionary::append(std::string_view key, PlistValue&& value) {
  entries_.emplace_back(key, std::move(value));
  if (!index_.empty()) {
    index_.emplace(std::string(key), size() - 1);
  } else if (size() == indexedFrom) {
    rebuildIndex();
  }
  return size();
}

void PlistDictionary::rebuildIndex() {
  index_.clear();
  if (size() < indexedFrom) return;
  for (std::size_t place = 0; place < size(); ++place) index_.emplace(entries_[place].first, place);
}

PlistValue::Array PlistArray::make(std::initializer_list<PlistValue> elements) {
  return std::make_shared<PlistArray>(elements);
}

void PlistArray::append(PlistValue value) {
  elements_.push_back(std::move(value));
}

PlistValue& PlistArray::rewrite(std::size_t place) {
  if (place == size()) elements_.emplace_back();
  return elements_.at(place);
}

void PlistArray::removeFirst(std::size_t count) {
  elements_.erase(elements_.begin(),
                  elements_.begin() + static_cast<std::ptrdiff_t>(std::min(count, size())));
}

void PlistArray::truncate(std::size_t size) {
  if (size < elements_.size()) elements_.resize(size);
}

}  // namespace kelvasi
