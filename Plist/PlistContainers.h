// SPDX-License-Identifier: Apache-2.0
// The two containers of a property list. Reached through PlistValue.h.
#pragma once

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "Plist/PlistHandle.h"

namespace kelvasi {

// Keys in the order in which they were first set; setting a key that is there keeps its place.
class PlistDictionary {
 public:
  using Entry = std::pair<std::string, PlistValue>;

  PlistDictionary() = default;
  PlistDictionary(std::initializer_list<Entry> entries);
  static PlistValue::Dictionary make(std::initializer_list<Entry> entries = {});

  std::size_t size() const { return entries_.size(); }
  bool empty() const { return entries_.empty(); }
  auto begin() const { return entries_.begin(); }
  auto end() const { return entries_.end(); }

  // Null when there is no such key. The pointer lasts until the dictionary next changes.
  const PlistValue* find(std::string_view key) const;
  // The absent value when there is no such key.
  PlistValue get(std::string_view key) const;

  // Makes room for so many entries at once.
  void reserve(std::size_t count) { entries_.reserve(count); }
  // An absent value removes the key.
  void set(std::string_view key, PlistValue value);
  bool remove(std::string_view key);
  void removeAll();

  // Sets `key` to a string, written into the string that stands there where there is one. `place` is where
  // the caller expects the key; a right guess saves the search. Returns the place after the key's.
  std::size_t setText(std::string_view key, std::string_view text, std::size_t place);
  std::size_t setText(std::string_view key, DeferredText text, std::size_t place);
  void setText(std::string_view key, std::string_view text) { setText(key, text, size()); }
  // Makes `key` the entry at `place`, at most size(): kept in place where it stands there, else it takes the
  // place of all entries from there on. For writing a whole dictionary anew, entry by entry, without emptying
  // it first.
  std::size_t rewriteText(std::string_view key, std::string_view text, std::size_t place);
  std::size_t rewriteText(std::string_view key, DeferredText text, std::size_t place);
  // The same for a value of any kind, for the caller to write at once over what stands there; an absent one
  // where the key is new. `place` becomes the next one, unless the key stands before it already.
  PlistValue& rewrite(std::string_view key, std::size_t& place);
  // Drops the entries from `place` on.
  void truncate(std::size_t place);

 private:
  template <typename Text>
  std::size_t setAnyText(std::string_view key, Text text, std::size_t place);
  template <typename Text>
  std::size_t rewriteAnyText(std::string_view key, Text text, std::size_t place);
  std::size_t placeOf(std::string_view key) const;
  std::size_t append(std::string_view key, PlistValue&& value);
  void rebuildIndex();

  struct Hash {
    using is_transparent = void;
    std::size_t operator()(std::string_view key) const { return std::hash<std::string_view>()(key); }
  };

  std::vector<Entry> entries_;
  // Key to place; kept only once the dictionary is large.
  std::unordered_map<std::string, std::size_t, Hash, std::equal_to<>> index_;
};

class PlistArray {
 public:
  PlistArray() = default;
  PlistArray(std::initializer_list<PlistValue> elements) : elements_(elements) {}
  static PlistValue::Array make(std::initializer_list<PlistValue> elements = {});

  std::size_t size() const { return elements_.size(); }
  bool empty() const { return elements_.empty(); }
  auto begin() const { return elements_.begin(); }
  auto end() const { return elements_.end(); }
  const PlistValue& at(std::size_t place) const { return elements_.at(place); }

  void reserve(std::size_t count) { elements_.reserve(count); }
  void append(PlistValue value);
  // The element at `place`, at most size(), for the caller to write at once over what stands there.
  PlistValue& rewrite(std::size_t place);
  void removeFirst(std::size_t count);
  void removeAll() { elements_.clear(); }
  void truncate(std::size_t size);

 private:
  std::vector<PlistValue> elements_;
};

}  // namespace kelvasi
