#include "Tools/Kelvasictl/DisplayJson.h"

#include <algorithm>
#include <cmath>
#include <nlohmann/json.hpp>
#include <string_view>

#include "Plist/Description.h"

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

std::string base64(const Bytes& bytes) {
  constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  std::string text;
  for (std::size_t at = 0; at < bytes.size(); at += 3) {
    const auto byte = [&](std::size_t index) -> unsigned { return index < bytes.size() ? bytes[index] : 0; };
    const unsigned group = byte(at) << 16 | byte(at + 1) << 8 | byte(at + 2);
    for (const unsigned shift : {18u, 12u, 6u, 0u}) text += digits[group >> shift & 63];
  }
  const std::size_t padding = (3 - bytes.size() % 3) % 3;
  return text.replace(text.size() - padding, padding, padding, '=');
}

std::string iso8601(PlistDate date) {
  constexpr double firstSecond = -62'135'596'800;  // 0001-01-01
  constexpr double lastSecond = 253'402'300'799;   // 9999-12-31
  const double seconds = std::isnan(date.secondsSince1970) ? 0 : date.secondsSince1970;
  std::string text = description(PlistDate{std::clamp(seconds, firstSecond, lastSecond)});
  text.resize(19);  // of "2024-03-05 14:07:09 +0000"
  text[10] = 'T';
  text += 'Z';
  return text;
}

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
