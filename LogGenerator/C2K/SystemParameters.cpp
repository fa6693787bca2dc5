#include "LogGenerator/C2K/SystemParameters.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

namespace {

using namespace systemParameters;

constexpr std::array roamingRows{
    C2KRow{"k1xRoamingHome", indexIn(layout, "roaming indicator"), roamingIndicatorText},
};
constexpr std::array identityRows{
    C2KRow{"kSystemId", indexIn(layout, "system identity"), decimalText},
    C2KRow{"kNetworkId", indexIn(layout, "network identity"), decimalText},
};
constexpr std::array cellRows{
    C2KRow{"kPacketZoneId", indexIn(layout, "packet zone identity"), decimalText},
    C2KRow{"kBaseId", indexIn(layout, "base identity"), decimalText},
    C2KRow{"kProtocolRevision", indexIn(layout, "protocol revision"), decimalText},
};

void showIdentities(const C2KUpdate& update) {
  const std::int64_t systemType = valueOf(update.record, fieldIn(layout, "system type"));
  if (systemType == cdmaSystem) return show(update, update.record, layout, identityRows);
  const FormattedText unknown("(unknown system type %d)", static_cast<int>(systemType));
  for (const C2KRow& row : identityRows) update.set(row.name, unknown);
}

}  // namespace

void parseSystemParameters(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x134f is %d bytes long but must be at least %lu bytes."))
    return;
  const std::int64_t version = valueOf(update.record, fieldIn(layout, "version"));
  if (version < minimumVersion) {
    update.log.print(LogPriority::error,
                     "Log code 0x134f has version=%d; only version 2 or higher expected; dropping.",
                     static_cast<int>(version));
    return;
  }
  show(update, update.record, layout, roamingRows);
  showIdentities(update);
  show(update, update.record, layout, cellRows);
}

}  // namespace kelvasi
