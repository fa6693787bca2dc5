#include "LogGenerator/Daemon/PDPContextList.h"

#include <array>

#include "Platform/PlistSerialiser.h"

namespace kelvasi {

namespace {
constexpr std::array logCodes{pdpContextLogCode};
}

std::span<const LogCode> PDPContextList::getLogCodeArray() const {
  return logCodes;
}

void PDPContextList::updateWithData(RecordView record, LogCode logCode) {
  trace("PDPContextList");
  if (logCode != pdpContextLogCode) return logUnknownMessage(logCode);
  const auto contexts = platform().plists.parse(record.payload());
  if (contexts && contexts->array() && sectionList()) replaceArrayWith(*sectionList(), *contexts->array());
}

}  // namespace kelvasi
