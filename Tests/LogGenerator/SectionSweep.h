// SPDX-License-Identifier: Apache-2.0
// Feeds records of every length to all decoders of a class index, each with a section of its own.
#pragma once

#include <gtest/gtest.h>

#include "LogGenerator/ClassIndex.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi::test {

struct SweptRecord {
  LogCode logCode = 0;
  std::size_t minimumLength = 0;
  std::uint8_t fill = 0xFF;  // of the payload that has to show rows
};

template <typename Index>
class SectionSweep {
 public:
  // Gives each subscriber of the code a section of its own.
  void bind(LogCode logCode) {
    for (Base* decoder : index_.getSubscribers(logCode)) {
      sections_.push_back(sectionFor(decoder->getSectionName()));
      decoder->updateSectionRef(sections_.back());
    }
  }

  // A record of `length` bytes in a buffer of exactly that size; every payload byte is `fill`.
  void take(LogCode logCode, std::size_t length, std::uint8_t fill) {
    Bytes bytes = record(logCode, "", 13);
    bytes.resize(length, fill);
    bytes.shrink_to_fit();
    for (Base* decoder : index_.getSubscribers(logCode)) {
      decoder->updateWithData(RecordView(bytes), logCode);
    }
  }

  // Neither empty sections nor those that a whole record has filled.
  void expectNoChangeBelowMinimum(SweptRecord swept) {
    bind(swept.logCode);
    expectNoChange(swept, "");
    take(swept.logCode, swept.minimumLength + 64, 0x01);
    expectNoChange(swept, shown());
  }

  void expectChangeFromMinimumOn(SweptRecord swept) {
    for (std::size_t length = swept.minimumLength; length <= swept.minimumLength + 2; ++length) {
      sections_.clear();
      bind(swept.logCode);
      take(swept.logCode, length, swept.fill);
      EXPECT_NE(shown(), "") << swept.logCode << " of " << length;
    }
  }

  // Counts of all ones over records that hold from none to some of the entries.
  void takeEveryCut(LogCode logCode) {
    bind(logCode);
    for (std::size_t length = 0; length <= 700; ++length) take(logCode, length, 0xFF);
    for (const std::size_t length : {2500U, 5000U}) take(logCode, length, 0xFF);
    EXPECT_NE(shown(), "");
  }

  std::string shown() const {
    std::string text;
    for (const PlistValue& section : sections_) text += asText(section);
    return text;
  }

 private:
  void expectNoChange(SweptRecord swept, const std::string& before) {
    for (std::size_t length = 0; length < swept.minimumLength; ++length) {
      take(swept.logCode, length, 0xFF);
      EXPECT_EQ(shown(), before) << swept.logCode << " of " << length;
    }
  }

  TestPlatform surroundings_;
  Index index_{surroundings_.platform()};
  std::vector<PlistValue> sections_;
};

}  // namespace kelvasi::test
