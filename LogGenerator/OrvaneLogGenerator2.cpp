// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/OrvaneLogGenerator2.h"

#include <algorithm>
#include <charconv>
#include <stdexcept>
#include <utility>

#include "LogGenerator/TemplateShape.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

constexpr const char* unknownObject = "Received an object of unknown type";

PlistValue storable(PlistValue value) {
  if (value.isAbsent())
    throw std::invalid_argument("a display template may hold strings, dictionaries and arrays only");
  return value;
}

bool isSameContainer(const PlistValue& one, const PlistValue& other) {
  const bool isContainer = one.dictionary() || one.array();
  return isContainer && one.dictionary() == other.dictionary() && one.array() == other.array();
}

std::string pathWith(std::string path, std::string_view step) {
  appendPathStep(path, step);
  return path;
}

// Logs ahead of what the base's construction logs.
const Platform& announced(const Platform& platform, const ClassIndex* cIndex) {
  platform.log.print(LogPriority::error, "Creating OrvaneLogGenerator2 object with %p",
                     static_cast<const void*>(cIndex));
  return platform;
}

}  // namespace

OrvaneLogGenerator2::OrvaneLogGenerator2(const Platform& platform, std::string pListName,
                                         std::unique_ptr<ClassIndex> cIndex)
    : OrvaneLogGenerator(announced(platform, cIndex.get())),
      pListName_(std::move(pListName)),
      cIndex_(std::move(cIndex)) {
  constexpr long owners = 1;  // the index has no other owner than its generator
  platform.log.print(LogPriority::error, "Class Index: %ld", owners);
}

OrvaneLogGenerator2::OrvaneLogGenerator2(const Platform& platform) : OrvaneLogGenerator(platform, bare) {}

OrvaneLogGenerator2::~OrvaneLogGenerator2() {
  // The same text for every template-driven generator.
  platform().log.print(LogPriority::warning, "Orvane_GSMLogGenerator is destructed %p",
                       static_cast<void*>(this));
}

void OrvaneLogGenerator2::updateWithData(std::span<const std::uint8_t> data) {
  const auto framed = frameRecord(data);
  if (readings()) readings()->begin(arrival(), framed ? framed->logCode : 0);
  if (!framed) return count(0, Outcome::notARecord, data);
  if (framed->hasKnownType()) return decode(*framed);
  platform().log.print(LogPriority::error, "Invalid log type: %x. Dropping.", unsigned{framed->logType});
  count(framed->logCode, Outcome::unknownLogType, framed->record.bytes());
}

// Of several decoders the first one says what became of the record, unless a later one showed it.
void OrvaneLogGenerator2::decode(const FramedRecord& framed) {
  std::optional<Outcome> outcome;
  std::optional<std::size_t> versionAt;
  for (Base* decoder : cIndex_ ? cIndex_->getSubscribers(framed.logCode) : std::span<Base* const>()) {
    const Outcome own = decoder->updateWithData(framed.record, framed.logCode);
    if (!outcome || own == Outcome::shown) outcome = own;
    if (!versionAt) versionAt = decoder->versionAt(framed.logCode);
  }
  count(framed.logCode, outcome.value_or(Outcome::notAskedFor), framed.record.bytes(), versionAt);
}

void OrvaneLogGenerator2::describe(RowCatalog& catalog) const {
  if (!cIndex_) return;
  for (const auto& decoder : cIndex_->decoders()) decoder->describe(catalog);
}

void OrvaneLogGenerator2::gatherInto(Readings* readings) {
  OrvaneLogGenerator::gatherInto(readings);
  if (cIndex_) cIndex_->gatherInto(readings);
}

void OrvaneLogGenerator2::updateState(PlistDictionary& state, std::span<const std::uint8_t> data) {
  getDisplayFromState(state);
  updateWithData(data);
  appendRawMessage(data);
}

PlistValue OrvaneLogGenerator2::generateLogUsingState(PlistDictionary& state) {
  const PlistValue display = getDisplayFromState(state);
  moveRawMessagesInto(state);
  updateHistoryInState(state, platform().clock);
  return display;
}

PlistValue OrvaneLogGenerator2::getStartCommand() const {
  const auto logCodes = PlistArray::make();
  const auto extraCodes = PlistArray::make();
  for (const std::string& text : cIndex_ ? cIndex_->getAllLogCodes() : std::vector<std::string>()) {
    LogCode code = 0;
    std::from_chars(text.data(), text.data() + text.size(), code);
    if (code >= extraLogCodes) {
      extraCodes->append(code - extraLogCodes);
    } else {
      logCodes->append(code);
    }
  }
  return PlistDictionary::make(
      {{"SetState", "Streaming"}, {"SetOrvaneLogCodes", logCodes}, {"SetTelvonExtraCodes", extraCodes}});
}

PlistValue OrvaneLogGenerator2::getDisplayFromState(PlistDictionary& state) {
  if (const PlistValue* display = state.find("Display")) {
    bindTo(state, *display);
    return *display;
  }
  if (!cIndex_ || !state.find("Template")) {
    const PlistValue loaded = loadTemplate();
    if (loaded.isAbsent()) {
      platform().log.print(LogPriority::error, "Cannot load template for display");
      return {};
    }
    state.set("Template", loaded);
  }
  platform().log.print(LogPriority::warning, "Initialized class index: %p, Self: %p",
                       static_cast<void*>(cIndex_.get()), static_cast<void*>(this));
  cIndex_->status();
  const PlistValue display = processTemplate(state.get("Template"));
  printDict(display);
  bound_ = display;
  isOwn_ = true;
  state.set("Display", display);
  state.set("ExtraInfo", PlistDictionary::make());
  return {};
}

bool OrvaneLogGenerator2::ownsDisplay(const PlistDictionary& state) const {
  const PlistValue* display = state.find("Display");
  if (!display) return true;
  if (isSameContainer(*display, bound_)) return isOwn_;
  const PlistValue* displayTemplate = state.find("Template");
  return displayTemplate && hasShapeOf(*displayTemplate, *display) && *displayTemplate == loadTemplate();
}

void OrvaneLogGenerator2::bindTo(const PlistDictionary& state, const PlistValue& display) {
  if (isSameContainer(display, bound_)) return;
  isOwn_ = ownsDisplay(state);
  bound_ = display;
  if (cIndex_) cIndex_->unbindSections();
  if (isOwn_) bindSections(*state.find("Template"), display, {});
}

PlistValue OrvaneLogGenerator2::loadTemplate() const {
  if (!cIndex_) return {};
  const auto bytes = platform().resources.contents(pListName_, "plist");
  const auto parsed = bytes ? platform().plists.parse(*bytes) : std::nullopt;
  return parsed && parsed->dictionary() ? *parsed : PlistValue();
}

PlistValue OrvaneLogGenerator2::processTemplate(const PlistValue& object) {
  return processTemplate(object, {});
}

PlistValue OrvaneLogGenerator2::processTemplate(const PlistValue& object, const std::string& path) {
  if (object.string()) return object;
  if (const PlistDictionary* entries = object.dictionary()) {
    const auto copy = PlistDictionary::make();
    for (const auto& [key, value] : *entries) {
      const std::string place = pathWith(path, key);
      const PlistValue processed = processTemplate(value, place);
      if (Base* decoder = cIndex_ ? cIndex_->getClass(key) : nullptr) {
        decoder->updateSectionRef(processed);
        decoder->setSectionPath(place);
      }
      copy->set(key, storable(processed));
    }
    return copy;
  }
  if (const PlistArray* elements = object.array()) {
    const auto copy = PlistArray::make();
    for (const PlistValue& element : *elements)
      copy->append(storable(processTemplate(element, pathWith(path, std::to_string(copy->size())))));
    return copy;
  }
  platform().log.print(LogPriority::error, "%s", unknownObject);
  platform().log.print(LogPriority::warning, "Processing the template");
  return {};
}

// In the order of processTemplate, so that the same occurrence of a section wins.
void OrvaneLogGenerator2::bindSections(const PlistValue& displayTemplate, const PlistValue& display,
                                       const std::string& path) {
  const PlistDictionary* entries = displayTemplate.dictionary();
  if (entries && display.dictionary()) {
    for (const auto& [key, value] : *entries) {
      const PlistValue section = display.dictionary()->get(key);
      if (section.isAbsent()) continue;
      const std::string place = pathWith(path, key);
      bindSections(value, section, place);
      if (Base* decoder = cIndex_ ? cIndex_->getClass(key) : nullptr) {
        decoder->moveToSection(section);
        decoder->setSectionPath(place);
      }
    }
  }
  const PlistArray* elements = displayTemplate.array();
  if (elements && display.array()) {
    const std::size_t count = std::min(elements->size(), display.array()->size());
    for (std::size_t place = 0; place < count; ++place)
      bindSections(elements->at(place), display.array()->at(place), pathWith(path, std::to_string(place)));
  }
}

void OrvaneLogGenerator2::printDict(const PlistValue& object) const {
  if (object.string()) return;
  if (const PlistDictionary* entries = object.dictionary()) {
    for (const auto& [key, value] : *entries) printDict(value);
  } else if (const PlistArray* elements = object.array()) {
    for (const PlistValue& element : *elements) printDict(element);
  } else {
    platform().log.print(LogPriority::error, "%s", unknownObject);
  }
}

}  // namespace kelvasi
