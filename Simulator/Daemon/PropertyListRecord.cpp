// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon/PropertyListRecord.h"

#include "LogGenerator/RecordWriter.h"

namespace kelvasi::sim {

std::optional<Bytes> propertyListRecord(LogCode logCode, const PlistValue& value,
                                        const PlistSerialiser& plists) {
  const auto payload = plists.serialiseXml(value);
  if (!payload) return std::nullopt;
  Bytes record = recordHeader(logCode);
  record.insert(record.end(), payload->begin(), payload->end());
  return record;
}

}  // namespace kelvasi::sim
