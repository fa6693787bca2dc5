// SPDX-License-Identifier: Apache-2.0
#include "Plist/PlistValue.h"

#include <algorithm>

namespace kelvasi {

PlistValue::PlistValue(Data data) {
  if (data) value_ = std::move(data);
}

PlistValue::PlistValue(Dictionary dictionary) {
  if (dictionary) value_ = std::move(dictionary);
}

PlistValue::PlistValue(Array array) {
  if (array) value_ = std::move(array);
}

const Bytes* PlistValue::data() const {
  const auto* data = std::get_if<Data>(&value_);
  return data ? data->get() : nullptr;
}

PlistDictionary* PlistValue::dictionary() const {
  const auto* dictionary = std::get_if<Dictionary>(&value_);
  return dictionary ? dictionary->get() : nullptr;
}

PlistArray* PlistValue::array() const {
  const auto* array = std::get_if<Array>(&value_);
  return array ? array->get() : nullptr;
}

PlistValue::Dictionary PlistValue::sharedDictionary() const {
  const auto* dictionary = std::get_if<Dictionary>(&value_);
  return dictionary ? *dictionary : nullptr;
}

PlistValue::Array PlistValue::sharedArray() const {
  const auto* array = std::get_if<Array>(&value_);
  return array ? *array : nullptr;
}

bool PlistValue::isShared() const {
  if (const auto* dictionary = std::get_if<Dictionary>(&value_)) return dictionary->use_count() > 1;
  const auto* array = std::get_if<Array>(&value_);
  return array && array->use_count() > 1;
}

PlistValue PlistValue::shallowCopy() const {
  if (const auto* entries = dictionary()) return std::make_shared<PlistDictionary>(*entries);
  if (const auto* elements = array()) return std::make_shared<PlistArray>(*elements);
  return *this;
}

bool PlistValue::operator==(const PlistValue& other) const {
  makeText();
  other.makeText();
  if (value_.index() != other.value_.index()) return false;
  if (const Bytes* bytes = data()) return *bytes == *other.data();
  if (const PlistArray* elements = array()) return std::ranges::equal(*elements, *other.array());
  if (const PlistDictionary* entries = dictionary()) {
    const PlistDictionary& others = *other.dictionary();
    return entries->size() == others.size() && std::ranges::all_of(*entries, [&](const auto& entry) {
             const PlistValue* match = others.find(entry.first);
             return match && entry.second == *match;
           });
  }
  return value_ == other.value_;
}

}  // namespace kelvasi
