#include "LogGenerator/C2K/C2KLookup.h"

namespace kelvasi {

namespace {

constexpr std::string_view sortedMark = "_sorted";

void appendEntry(const std::string& name, const std::string& key, const PlistValue& display,
                 PlistDictionary& lookup) {
  display.dictionary()->set(key, "");
  if (!lookup.find(name)) lookup.set(name, PlistArray::make());
  lookup.find(name)->array()->append(PlistDictionary::make({{"key", key}, {"dict", display}}));
}

}  // namespace

void fillFromTemplate(const PlistDictionary& displayTemplate, const PlistValue& display,
                      PlistDictionary& lookup, SystemLog& log) {
  PlistDictionary& rows = *display.dictionary();
  for (const auto& [key, value] : displayTemplate) {
    if (const PlistDictionary* section = value.dictionary()) {
      const PlistValue nested = PlistDictionary::make();
      fillFromTemplate(*section, nested, lookup, log);
      rows.set(key, nested);
    } else if (const std::string* name = value.string()) {
      if (*name == sortedMark) {
        rows.set(key, *name);
      } else {
        appendEntry(*name, key, display, lookup);
      }
    }
  }
  log.print(LogPriority::warning, "Processing the template");
}

void setByLookup(std::string_view name, const PlistValue& value, const PlistDictionary& lookup) {
  const PlistValue* entries = lookup.find(name);
  if (!entries || !entries->array()) return;
  for (const PlistValue& entry : *entries->array()) {
    const PlistDictionary* leaf = entry.dictionary();
    const PlistValue* display = leaf ? leaf->find("dict") : nullptr;
    const PlistValue* key = leaf ? leaf->find("key") : nullptr;
    if (!display || !display->dictionary() || !key || !key->string()) return;
    display->dictionary()->set(*key->string(), value);
  }
}

}  // namespace kelvasi
