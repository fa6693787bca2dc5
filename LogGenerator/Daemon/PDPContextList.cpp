// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Daemon/PDPContextList.h"

#include <array>

#include "LogGenerator/Row.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

namespace {
constexpr std::array logCodes{pdpContextLogCode};
}

std::span<const LogCode> PDPContextList::getLogCodeArray() const {
  return logCodes;
}

void PDPContextList::describe(RowCatalog& catalog) const {
  static constexpr Row anyValue{.key = "", .quantity = quantity::text};
  catalog.add({.section = std::string(getSectionName()),
               .key = "*",
               .logCode = pdpContextLogCode,
               .row = &anyValue,
               .source = "*"});
}

Outcome PDPContextList::updateWithData(RecordView record, LogCode logCode) {
  trace("PDPContextList");
  if (logCode != pdpContextLogCode) {
    logUnknownMessage(logCode);
    return Outcome::notAskedFor;
  }
  const auto contexts = platform().plists.parse(record.payload());
  if (!contexts || !contexts->array()) return Outcome::propertyListRefused;
  if (!sectionList()) return Outcome::sectionMissing;
  if (readings()) gather(*contexts->array());
  replaceArrayWith(*sectionList(), *contexts->array());
  return Outcome::shown;
}

void PDPContextList::gather(const PlistArray& contexts) const {
  const ReadingSection& section = *place().section;
  readings()->addRemovals(section, {}, sectionList()->size());
  for (std::size_t at = 0; at < contexts.size(); ++at) readings()->addEntry(section, at, contexts.at(at));
}

}  // namespace kelvasi
