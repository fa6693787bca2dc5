// SPDX-License-Identifier: Apache-2.0
// A decoder with a section of its own, for tests that feed it records and look at its rows.
#pragma once

#include <string>
#include <string_view>

#include "LogGenerator/Base.h"
#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::test {

// "Key=text" a line, in stored order; a nested list or dictionary in braces or brackets.
inline std::string asText(const PlistValue& value) {
  if (const auto* text = value.string()) return *text;
  std::string lines;
  if (const auto* rows = value.dictionary()) {
    for (const auto& [key, row] : *rows) lines += key + "=" + asText(row) + "\n";
    return lines;
  }
  if (const auto* elements = value.array()) {
    for (const PlistValue& element : *elements) lines += "[" + asText(element) + "]";
    return lines;
  }
  return "(neither text nor container)";
}

// An empty section of the decoder's kind.
inline PlistValue sectionFor(const Base& decoder) {
  if (decoder.sectionKind() == SectionKind::list) return PlistArray::make();
  return PlistDictionary::make();
}

template <typename Decoder>
struct SectionFixture {
  explicit SectionFixture(PlistValue container) : section(std::move(container)) {
    decoder.updateSectionRef(section);
  }
  static SectionFixture rows() { return SectionFixture(PlistDictionary::make()); }
  static SectionFixture list() { return SectionFixture(PlistArray::make()); }

  // The effective log code is that of the record's own header.
  void take(const Bytes& bytes) {
    const LogCode code =
        static_cast<LogCode>(bytes.at(3) | (bytes.at(4) << 8)) | (bytes.at(0) == 0xFF ? 0xFF0000u : 0u);
    decoder.updateWithData(RecordView(bytes), code);
  }
  // A record whose payload is the property list `value`.
  void takeList(LogCode code, PlistValue value) {
    const Bytes token = surroundings.plists.standFor(std::move(value));
    take(textRecord(code, std::string(token.begin(), token.end())));
  }
  std::string text() const { return asText(section); }

  TestPlatform surroundings;
  Decoder decoder{surroundings.platform()};
  PlistValue section;
};

}  // namespace kelvasi::test
