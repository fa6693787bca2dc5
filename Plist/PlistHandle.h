// SPDX-License-Identifier: Apache-2.0
// The value itself: all of PlistValue.h but the two containers.
#pragma once

#include <concepts>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace kelvasi {

class PlistArray;
class PlistDictionary;

using Bytes = std::vector<std::uint8_t>;

// A moment, in seconds since 1 January 1970 UTC.
struct PlistDate {
  double secondsSince1970 = 0;
  bool operator==(const PlistDate&) const = default;
};

// A text that is made when somebody looks: `make` gives it from `source`, which lasts as long as the process,
// and a number.
struct DeferredText {
  std::string (*make)(const void* source, std::int64_t number) = nullptr;
  const void* source = nullptr;
  std::int64_t number = 0;
  bool operator==(const DeferredText&) const = default;
};

class PlistValue {
 public:
  using Array = std::shared_ptr<PlistArray>;
  using Data = std::shared_ptr<const Bytes>;
  using Dictionary = std::shared_ptr<PlistDictionary>;

  PlistValue() = default;  // the absent value
  PlistValue(std::string text) : value_(std::move(text)) {}
  PlistValue(std::string_view text) : value_(std::string(text)) {}
  PlistValue(const char* text) : value_(std::string(text)) {}
  PlistValue(DeferredText text) : value_(text) {}
  PlistValue(bool flag) : value_(flag) {}
  template <std::integral Integer>
  requires(!std::same_as<Integer, bool>) PlistValue(Integer number) {
    if (std::in_range<std::int64_t>(number)) {
      value_ = static_cast<std::int64_t>(number);
    } else {
      value_ = static_cast<std::uint64_t>(number);
    }
  }
  PlistValue(double number) : value_(number) {}
  PlistValue(PlistDate date) : value_(date) {}
  PlistValue(Bytes bytes) : value_(std::make_shared<const Bytes>(std::move(bytes))) {}
  PlistValue(Data data);              // a null pointer is the absent value
  PlistValue(Dictionary dictionary);  // likewise
  PlistValue(Array array);            // likewise

  bool isAbsent() const { return std::holds_alternative<std::monostate>(value_); }
  explicit operator bool() const { return !isAbsent(); }

  // Each returns null when the value is of another kind. A deferred text is a string, made at the first look;
  // so a value is for one thread, also for those who only look.
  const std::string* string() const {
    makeText();
    return std::get_if<std::string>(&value_);
  }
  std::string* string() {
    makeText();
    return std::get_if<std::string>(&value_);
  }
  const std::int64_t* integer() const { return std::get_if<std::int64_t>(&value_); }
  // Integers of 2^63 and more; the others are integer()'s.
  const std::uint64_t* unsignedInteger() const { return std::get_if<std::uint64_t>(&value_); }
  const double* real() const { return std::get_if<double>(&value_); }
  const bool* boolean() const { return std::get_if<bool>(&value_); }
  const PlistDate* date() const { return std::get_if<PlistDate>(&value_); }
  const Bytes* data() const;
  PlistDictionary* dictionary() const;
  PlistArray* array() const;

  // The shared containers themselves; null when the value is of another kind.
  Dictionary sharedDictionary() const;
  Array sharedArray() const;

  // Whether others hold this container, too.
  bool isShared() const;

  // The same value, its outermost container copied; nested containers stay shared. Data needs no copy: it
  // never changes.
  PlistValue shallowCopy() const;

  // Becomes this text. One that nobody looked at is replaced at no cost.
  void set(DeferredText text) {
    if (auto* standing = std::get_if<DeferredText>(&value_)) {
      *standing = text;
    } else {
      value_ = text;
    }
  }
  // Becomes this text, in the room of the string that stands there, if any.
  void set(std::string_view text) {
    if (auto* standing = std::get_if<std::string>(&value_)) {
      standing->assign(text);
    } else {
      value_ = std::string(text);
    }
  }

  // Equal kind and content, dictionaries whatever the order of their keys.
  bool operator==(const PlistValue& other) const;

 private:
  void makeText() const {
    if (const auto* text = std::get_if<DeferredText>(&value_))
      value_ = text->make(text->source, text->number);
  }

  // Mutable for the text that the first look makes.
  mutable std::variant<std::monostate, std::string, std::int64_t, std::uint64_t, double, bool, PlistDate,
                       Data, Dictionary, Array, DeferredText>
      value_;
};

}  // namespace kelvasi
