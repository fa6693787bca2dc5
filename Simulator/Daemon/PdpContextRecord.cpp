// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon/PdpContextRecord.h"

#include "LogGenerator/LogCode.h"
#include "Simulator/Daemon/PropertyListRecord.h"

namespace kelvasi::sim::gsm {

namespace {

PlistValue contextEntry(const PdpContext& context) {
  return PlistDictionary::make({{"NSAPI", std::to_string(context.nsapi)},
                                {"Access Point Name", context.accessPoint},
                                {"PDP Type", "IPv4"},
                                {"PDP Address", context.address}});
}

}  // namespace

std::optional<Bytes> pdpContextRecord(const std::vector<PdpContext>& contexts,
                                      const PlistSerialiser& plists) {
  const auto list = PlistArray::make();
  for (const PdpContext& context : contexts) list->append(contextEntry(context));
  return propertyListRecord(pdpContextLogCode, list, plists);
}

}  // namespace kelvasi::sim::gsm
