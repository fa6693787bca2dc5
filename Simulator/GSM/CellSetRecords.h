// SPDX-License-Identifier: Apache-2.0
// The records of cell sets: what the searcher follows, and what is ranked for reselection.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

// The UMTS cells: the active set, then the monitored ones. Without cells while UMTS does not serve.
std::optional<Bytes> cellSetsRecord(const World& world);  // 0x417A

// 0x4005: the serving cell and its neighbours of the same technology. Both lists of the record begin at the
// same byte, so one of them is always empty. The first is nothing while GSM serves and without cells while
// nothing does; the second is nothing unless GSM serves.
std::optional<Bytes> rankedUmtsCellsRecord(const World& world);
std::optional<Bytes> rankedGsmCellsRecord(const World& world);

}  // namespace kelvasi::sim::gsm
