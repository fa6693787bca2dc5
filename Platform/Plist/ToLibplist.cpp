// SPDX-License-Identifier: Apache-2.0
#include <chrono>
#include <cmath>
#include <string>

#include "Platform/Plist/Allowance.h"
#include "Platform/Plist/LibplistNode.h"
#include "Platform/Plist/PlistLimits.h"
#include "Platform/Plist/Utf8.h"

namespace kelvasi {

namespace {

class Writer {
 public:
  LibplistNode value(const PlistValue& value, int level);

 private:
  LibplistNode scalar(const PlistValue& value);
  LibplistNode string(const std::string& text);
  LibplistNode data(const Bytes& bytes);
  LibplistNode array(const PlistArray& elements, int level);
  LibplistNode dictionary(const PlistDictionary& entries, int level);

  Allowance allowance_{plistLimits::writtenValues, plistLimits::writtenContentBytes};
};

LibplistNode dateNode(PlistDate date) {
  using namespace std::chrono;
  // The library writes years without leading zeros.
  constexpr sys_days first{year(1000) / January / 1};
  constexpr sys_days end{year(10000) / January / 1};
  const auto secondsUntil = [](sys_days day) {
    return static_cast<double>(duration_cast<seconds>(day.time_since_epoch()).count());
  };
  const double whole = std::floor(date.secondsSince1970);
  if (!(whole >= secondsUntil(first) && whole < secondsUntil(end))) return nullptr;
  return dateToLibplist({whole});
}

// The library's own call makes a negative number of it.
LibplistNode unsignedNode(std::uint64_t number) {
  const std::string document = "<plist><integer>" + std::to_string(number) + "</integer></plist>";
  plist_t node = nullptr;
  plist_from_xml(document.data(), static_cast<std::uint32_t>(document.size()), &node);
  return LibplistNode(node);
}

LibplistNode Writer::value(const PlistValue& value, int level) {
  if (!allowance_.takeValues(1)) return nullptr;
  const PlistArray* elements = value.array();
  const PlistDictionary* entries = value.dictionary();
  if (!elements && !entries) return scalar(value);
  if (level == plistLimits::levels) return nullptr;
  return elements ? array(*elements, level + 1) : dictionary(*entries, level + 1);
}

LibplistNode Writer::scalar(const PlistValue& value) {
  if (const auto* text = value.string()) return string(*text);
  if (const auto* bytes = value.data()) return data(*bytes);
  if (const auto* date = value.date()) return dateNode(*date);
  if (const auto* flag = value.boolean()) return LibplistNode(plist_new_bool(*flag ? 1 : 0));
  if (const auto* real = value.real()) return LibplistNode(plist_new_real(*real));
  if (const auto* integer = value.integer()) {
    return LibplistNode(plist_new_uint(static_cast<std::uint64_t>(*integer)));
  }
  if (const auto* integer = value.unsignedInteger()) return unsignedNode(*integer);
  return nullptr;
}

LibplistNode Writer::string(const std::string& text) {
  if (!allowance_.takeBytes(text.size())) return nullptr;
  return LibplistNode(plist_new_string(asXmlText(text).c_str()));
}

LibplistNode Writer::data(const Bytes& bytes) {
  if (!allowance_.takeBytes(bytes.size())) return nullptr;
  const char* content = bytes.empty() ? "" : reinterpret_cast<const char*>(bytes.data());
  return LibplistNode(plist_new_data(content, bytes.size()));
}

LibplistNode Writer::array(const PlistArray& elements, int level) {
  LibplistNode node(plist_new_array());
  for (const PlistValue& element : elements) {
    LibplistNode item = value(element, level);
    if (!item) return nullptr;
    plist_array_append_item(node.get(), item.release());
  }
  return node;
}

LibplistNode Writer::dictionary(const PlistDictionary& entries, int level) {
  LibplistNode node(plist_new_dict());
  for (const auto& [key, entry] : entries) {
    LibplistNode item = value(entry, level);
    if (!item || !allowance_.takeBytes(key.size())) return nullptr;
    plist_dict_set_item(node.get(), asXmlText(key).c_str(), item.release());
  }
  return node;
}

}  // namespace

LibplistNode toLibplist(const PlistValue& value) {
  return Writer().value(value, 0);
}

}  // namespace kelvasi
