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

void SimInfo::updateWithData(RecordView record, LogCode logCode) {
  trace("SimInfo");
  if (logCode != simFilesLogCode) return;
  const auto parsed = platform().plists.parse(record.payload());
  if (!parsed) {
    log().write(LogPriority::error, "SIM File dictionary data could not be constructed");
    throw LogCode_0xFF000020::UnknownDataException();
  }
  if (!parsed->dictionary() || !sectionRows()) return;
  for (const simFiles::SimFile& file : simFiles::files) {
    const PlistValue* value = parsed->dictionary()->find(file.key);
    if (value && value->string()) {
      sectionRows()->setText(file.row, *value->string());
    } else if (value) {
      sectionRows()->set(file.row, *value);
    }
  }
}

}  // namespace kelvasi
