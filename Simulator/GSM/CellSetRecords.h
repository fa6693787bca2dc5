// The records of cell sets: what the searcher follows, and what is ranked for reselection.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

// The UMTS cells: the active set, then the monitored ones. Without cells while UMTS does not serve.
std::optional<Bytes> cellSetsRecord(const World& world);  // 0x417A

// The serving cell and its neighbours. Of the serving technology only: both lists of the record begin at the
// same byte, so one of them is always empty.
std::optional<Bytes> neighbourSetsRecord(const World& world);  // 0x4005

}  // namespace kelvasi::sim::gsm
