// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Daemon/SimInfo.h"

#include "LogGenerator/Daemon/SimFiles.h"
#include "LogGenerator/Exceptions.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {
constexpr std::array logCodes{simFilesLogCode};
}

std::span<const LogCode> SimInfo::getLogCodeArray() const {
  return logCodes;
}

void SimInfo::describe(RowCatalog& catalog) const {
  static constexpr Row anyValue{.key = "", .quantity = quantity::text};
  for (const simFiles::SimFile& file : simFiles::files) {
    catalog.add({.section = std::string(getSectionName()),
                 .key = std::string(file.row),
                 .logCode = simFilesLogCode,
                 .row = &anyValue,
                 .source = std::string(file.key)});
  }
}

Outcome SimInfo::updateWithData(RecordView record, LogCode logCode) {
  trace("SimInfo");
  if (logCode != simFilesLogCode) return Outcome::notAskedFor;
  const auto parsed = platform().plists.parse(record.payload());
  if (!parsed) {
    log().write(LogPriority::error, "SIM File dictionary data could not be constructed");
    throw LogCode_0xFF000020::UnknownDataException();
  }
  if (!parsed->dictionary()) return Outcome::propertyListRefused;
  if (!sectionRows()) return Outcome::sectionMissing;
  for (const simFiles::SimFile& file : simFiles::files) {
    if (const PlistValue* value = parsed->dictionary()->find(file.key)) show(file.row, *value);
  }
  return Outcome::shown;
}

void SimInfo::show(std::string_view row, const PlistValue& value) const {
  const bool isNew = !sectionRows()->find(row);
  if (value.string()) {
    sectionRows()->setText(row, *value.string());
  } else {
    sectionRows()->set(row, value);
  }
  if (readings()) readings()->addValue(*place().section, row, value, isNew);
}

}  // namespace kelvasi
