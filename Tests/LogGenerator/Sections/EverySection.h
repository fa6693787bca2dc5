// SPDX-License-Identifier: Apache-2.0
// Feeds records of every length to all decoders of a class index, each with a section of its own.
#pragma once

#include <vector>

#include "Tests/LogGenerator/Sections/ClassIndexes.h"

namespace kelvasi::test {

// A record of `length` bytes in a buffer of exactly that size; every payload byte is `fill`.
inline Bytes filled(LogCode logCode, std::size_t length, std::uint8_t fill) {
  Bytes bytes = record(logCode, "", 13);
  bytes.resize(length, fill);
  bytes.shrink_to_fit();
  return bytes;
}

template <typename Index>
class EverySection {
 public:
  EverySection() : EverySection(nullptr) {}
  explicit EverySection(SystemLog& log) : EverySection(&log) {}

  // The code's decoders show their rows from now on.
  void bind(LogCode logCode) {
    for (Base* decoder : index.getSubscribers(logCode)) {
      sections_.push_back(sectionFor(*decoder));
      decoder->updateSectionRef(sections_.back());
    }
  }
  // What becomes of the record at each of the code's decoders.
  std::vector<Outcome> take(LogCode logCode, const Bytes& bytes) {
    std::vector<Outcome> outcomes;
    for (Base* decoder : index.getSubscribers(logCode))
      outcomes.push_back(decoder->updateWithData(RecordView(bytes), logCode));
    return outcomes;
  }
  std::vector<Outcome> take(LogCode logCode, std::size_t length, std::uint8_t fill) {
    return take(logCode, filled(logCode, length, fill));
  }
  // The least length at which no decoder finds the record too short.
  std::size_t minimumLength(LogCode logCode) {
    std::size_t length = 0;
    while (length < longest && std::ranges::count(take(logCode, length, 0xFF), Outcome::tooShort) != 0)
      ++length;
    return length;
  }
  std::string shown() const {
    std::string text;
    for (const PlistValue& section : sections_) text += asText(section);
    return text;
  }

  static constexpr std::size_t longest = 5000;

  TestPlatform surroundings;
  Index index;

 private:
  // Null: the log of the surroundings.
  explicit EverySection(SystemLog* log)
      : index({log ? *log : surroundings.log, surroundings.trace, surroundings.plists, surroundings.resources,
               surroundings.clock}) {}

  std::vector<PlistValue> sections_;
};

}  // namespace kelvasi::test
