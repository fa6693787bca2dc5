// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/DisplayJson.h"

#include <cmath>
#include <nlohmann/json.hpp>

#include "Plist/Encoding.h"

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

Json real(double number) {
  if (std::isfinite(number)) return number;
  return std::isnan(number) ? "nan" : number > 0 ? "inf" : "-inf";
}

Json toJson(const PlistValue& value);

Json object(const PlistDictionary& entries) {
  Json json = Json::object();
  // The keys differ, so none has to be looked for.
  auto& members = json.get_ref<Json::object_t&>();
  members.reserve(entries.size());
  for (const auto& [key, value] : entries) members.emplace_back(key, toJson(value));
  return json;
}

Json array(const PlistArray& elements) {
  Json json = Json::array();
  for (const PlistValue& element : elements) json.push_back(toJson(element));
  return json;
}

Json toJson(const PlistValue& value) {
  if (const auto* text = value.string()) return *text;
  if (const auto* entries = value.dictionary()) return object(*entries);
  if (const auto* elements = value.array()) return array(*elements);
  if (const auto* integer = value.integer()) return *integer;
  if (const auto* integer = value.unsignedInteger()) return *integer;
  if (const auto* number = value.real()) return real(*number);
  if (const auto* flag = value.boolean()) return *flag;
  if (const auto* bytes = value.data()) return Json{{"$data", base64(*bytes)}};
  if (const auto* date = value.date()) return Json{{"$date", iso8601(*date)}};
  return nullptr;
}

std::string textOf(const Json& json, int indent) {
  return json.dump(indent, ' ', false, Json::error_handler_t::replace) + "\n";
}

}  // namespace

std::string displayJson(const PlistValue& display) {
  return textOf(toJson(display), 1);
}

std::string tickJson(double time, const PlistValue& display) {
  Json line = Json::object();
  line["time"] = time;
  line["display"] = toJson(display);
  return textOf(line, -1);
}

}  // namespace kelvasi
