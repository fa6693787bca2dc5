// SPDX-License-Identifier: Apache-2.0
// Decodes messages as a viewer does, with the generator of a technology, and lets a test read the display.
#pragma once

#include <charconv>
#include <string>
#include <vector>

#include "LogGenerator/LogGenerator.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Simulator/Message.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::sim::test {

struct SectionOfTemplate {
  std::string_view name;
  bool isList = false;
};

class DecodingViewer {
 public:
  // The template has these sections and is found as `templateName`.
  DecodingViewer(std::string_view technology, std::string_view templateName,
                 std::span<const SectionOfTemplate> sections)
      : DecodingViewer(technology, templateName, templateOf(sections)) {
    surroundings_.log.isMasked = true;
  }
  // The same with a template as it is. Warnings are remembered as well.
  DecodingViewer(std::string_view technology, std::string_view templateName, const PlistValue& display) {
    surroundings_.resources.files[std::string(templateName) + ".plist"] =
        plists_.serialiseXml(display).value();
    generator_ = LogGenerator::generatorFromTechnology(technology, platform());
    surroundings_.log.clear();
  }

  void take(const Messages& messages) {
    for (const Message& message : messages) generator_->updateState(*state_, message.bytes);
  }
  // Only records of this code.
  void take(const Messages& messages, LogCode code) {
    for (const Message& message : messages) {
      if (message.logCode == code) generator_->updateState(*state_, message.bytes);
    }
  }

  // "(none)" for a row that is not there.
  std::string text(std::string_view section, std::string_view row) const {
    const PlistValue rows = sectionOf(section);
    const PlistValue value = rows.dictionary() ? rows.dictionary()->get(row) : PlistValue();
    return value.string() ? *value.string() : "(none)";
  }
  // The number that a row's text begins with; nothing where there is none.
  std::optional<double> number(std::string_view section, std::string_view row) const {
    return leadingNumber(text(section, row));
  }
  // A row of every entry of a list section.
  std::vector<std::string> column(std::string_view section, std::string_view row) const {
    std::vector<std::string> texts;
    const PlistValue list = sectionOf(section);
    if (!list.array()) return texts;
    for (const PlistValue& entry : *list.array()) {
      const PlistValue value = entry.dictionary() ? entry.dictionary()->get(row) : PlistValue();
      texts.push_back(value.string() ? *value.string() : "(none)");
    }
    return texts;
  }
  PlistValue display() const { return state_->get("Display"); }
  PlistValue sectionOf(std::string_view section) const {
    const PlistValue all = display();
    return all.dictionary() ? all.dictionary()->get(section) : PlistValue();
  }
  std::size_t entries(std::string_view section) const {
    const PlistValue list = sectionOf(section);
    return list.array() ? list.array()->size() : 0;
  }
  PlistValue inState(std::string_view key) const { return state_->get(key); }
  std::vector<std::string> errors() const { return surroundings_.log.errors(); }
  std::vector<std::string> warnings() const { return surroundings_.log.warnings(); }
  LogGenerator& generator() { return *generator_; }

  static std::optional<double> leadingNumber(const std::string& text) {
    double value = 0;
    const char* const begin = text.data();
    return std::from_chars(begin, begin + text.size(), value).ec == std::errc() ? std::optional(value)
                                                                                : std::nullopt;
  }

 private:
  static PlistValue templateOf(std::span<const SectionOfTemplate> sections) {
    const auto display = PlistDictionary::make();
    for (const SectionOfTemplate& section : sections)
      display->set(section.name,
                   section.isList ? PlistValue(PlistArray::make()) : PlistValue(PlistDictionary::make()));
    return display;
  }
  Platform platform() {
    return {surroundings_.log, surroundings_.trace, plists_, surroundings_.resources, surroundings_.clock};
  }

  kelvasi::test::TestPlatform surroundings_;
  LibplistSerialiser plists_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
};

}  // namespace kelvasi::sim::test
