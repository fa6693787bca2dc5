#include "LogGenerator/C2K/C2KLookup.h"

namespace kelvasi {

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
