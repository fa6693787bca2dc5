// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/SystemParameters.h"

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

using namespace systemParameters;

constexpr std::array roamingRows{
    Row{.key = "k1xRoamingHome",
        .quantity = quantity::roaming,
        .field = indexIn(layout, "roaming indicator"),
        .texts = roamingIndicators,
        .otherwise = otherIndicator},
};
constexpr std::array identityRows{
    Row{.key = "kSystemId", .quantity = quantity::sid, .field = indexIn(layout, "system identity")},
    Row{.key = "kNetworkId", .quantity = quantity::nid, .field = indexIn(layout, "network identity")},
};
// Of a system of another type, whose identities are not known.
constexpr Row unknownSystem(std::string_view key, const Quantity& quantity) {
  return {.key = key,
          .quantity = quantity,
          .field = indexIn(layout, "system type"),
          .before = "(unknown system type ",
          .unit = ")",
          .hasNumber = false};
}
constexpr std::array unknownRows{unknownSystem("kSystemId", quantity::sid),
                                 unknownSystem("kNetworkId", quantity::nid)};
constexpr std::array cellRows{
    Row{.key = "kPacketZoneId",
        .quantity = quantity::packetZone,
        .field = indexIn(layout, "packet zone identity")},
    Row{.key = "kBaseId", .quantity = quantity::baseId, .field = indexIn(layout, "base identity")},
    Row{.key = "kProtocolRevision",
        .quantity = quantity::protocolRevision,
        .field = indexIn(layout, "protocol revision")},
};

}  // namespace

std::span<const RecordPart> systemParameters::parts() {
  static constexpr std::array shown{
      RecordPart{logCode, layout, roamingRows},
      RecordPart{logCode, layout, identityRows},
      RecordPart{logCode, layout, unknownRows},
      RecordPart{logCode, layout, cellRows},
  };
  return shown;
}

Outcome systemParameters::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x134f is %d bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const std::int64_t version = valueOf(update.record, fieldIn(layout, "version"));
  if (version < minimumVersion) {
    update.log.print(LogPriority::error,
                     "Log code 0x134f has version=%d; only version 2 or higher expected; dropping.",
                     static_cast<int>(version));
    return Outcome::notUnderstood;
  }
  const bool isCdma = valueOf(update.record, fieldIn(layout, "system type")) == cdmaSystem;
  show(update, update.record, layout, roamingRows);
  show(update, update.record, layout, isCdma ? identityRows : unknownRows);
  show(update, update.record, layout, cellRows);
  return Outcome::shown;
}

}  // namespace kelvasi
