// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/TemplateShape.h"

#include <algorithm>

namespace kelvasi {

bool hasShapeOf(const PlistValue& displayTemplate, const PlistValue& display) {
  if (displayTemplate.array()) return display.array() != nullptr;
  const PlistDictionary* sections = displayTemplate.dictionary();
  if (!sections) return true;  // a text, which a decoder may have replaced or removed
  return display.dictionary() && std::ranges::all_of(*sections, [&display](const auto& section) {
           return hasShapeOf(section.second, display.dictionary()->get(section.first));
         });
}

}  // namespace kelvasi
