// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ObjectStream/GSMLogGenerator.h"

#include <string>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/ObjectStream/ObjectReadings.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

namespace {

// The name that its assertions give, wherever the file lies.
constexpr const char* source = "LogGenerator/GSM/GSMLogGenerator";

// What an object that does not belong into a display is called in the failure's text.
const char* className(const PlistValue& object) {
  if (object.integer() || object.unsignedInteger()) return "int";
  if (object.real()) return "double";
  if (object.boolean()) return "bool";
  if (object.data()) return "bytes";
  return object.date() ? "date" : "null";
}

PlistValue collapsed(const PlistValue& object) {
  PlistValue only = GSMLogGenerator::canCollapse(object);
  return only.isAbsent() ? object : only;
}

}  // namespace

std::unique_ptr<LogGenerator> GSMLogGenerator::generator(const Platform& platform) {
  return std::make_unique<GSMLogGenerator>(platform);
}

void GSMLogGenerator::updateState(PlistDictionary& state, std::span<const std::uint8_t> data) {
  if (readings()) readings()->begin(arrival(), 0);
  const auto message = platform().plists.parse(data);
  if (!message) throw AssertionFailure(source, "Could not deserialize the object");
  const PlistValue display = processObject(*message);
  state.set("DisplayState", *message);
  state.set("Display", display);
  state.set("ExtraInfo", PlistDictionary::make());
  count(0, Outcome::shown, data);
  if (!readings()) return;
  readings()->addDisplay(display, roleOfObjectSection);
  nameObjectReadings(readings()->all());
}

// The names may stand anywhere.
void GSMLogGenerator::describe(RowCatalog& catalog) const {
  catalog.add({}, {.rows = objectRows()});
}

PlistValue GSMLogGenerator::generateLogUsingState(PlistDictionary& state) {
  updateHistoryInState(state, platform().clock);
  return state.get("Display");
}

PlistValue GSMLogGenerator::getStartCommand() const {
  return PlistDictionary::make({{"SetState", "Streaming"}});
}

// The Orvane generators keep raw messages there, or nothing before their first tick.
bool GSMLogGenerator::ownsDisplay(const PlistDictionary& state) const {
  const PlistValue* message = state.find("DisplayState");
  return !state.find("Display") || (message && !message->data());
}

PlistValue GSMLogGenerator::getSaveContentsFromState(const PlistDictionary& state) const {
  const PlistValue history = state.get("History");
  return history.array() ? history.shallowCopy() : PlistArray::make();
}

PlistValue GSMLogGenerator::processObject(const PlistValue& object) {
  if (object.string()) return object;
  if (const PlistDictionary* entries = object.dictionary()) {
    const auto copy = PlistDictionary::make();
    for (const auto& [key, value] : *entries) copy->set(key, collapsed(processObject(value)));
    return copy;
  }
  if (const PlistArray* elements = object.array()) {
    const auto copy = PlistArray::make();
    for (const PlistValue& element : *elements) copy->append(collapsed(processObject(element)));
    return copy;
  }
  throw AssertionFailure(source, std::string("Unknown object of type ") + className(object) + " encountered");
}

PlistValue GSMLogGenerator::canCollapse(const PlistValue& object) {
  const PlistDictionary* entries = object.dictionary();
  return entries && entries->size() == 1 ? entries->begin()->second : PlistValue();
}

}  // namespace kelvasi
