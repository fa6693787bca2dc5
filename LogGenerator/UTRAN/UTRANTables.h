// SPDX-License-Identifier: Apache-2.0
// The sections of UTRAN whose decoder is a table and nothing else. The records' own files have the rows.
#pragma once

#include <array>

#include "LogGenerator/ListDecoder.h"
#include "LogGenerator/UTRAN/ChannelMeasurement.h"
#include "LogGenerator/UTRAN/GSMNeighborCells.h"

namespace kelvasi {

namespace utranTables {

using namespace utran;

// The block error rates of the transport channels.
inline constexpr std::array channelCodes{channelMeasurement::logCode};
inline constexpr ListSection transportChannels{.name = "TRCH BLER",
                                               .trace = "TRCH BLER Measurement",
                                               .tracePriority = LogPriority::notice,
                                               .logCodes = channelCodes,
                                               .logCode = channelMeasurement::logCode,
                                               .minimumLength = channelMeasurement::minimumLength,
                                               .list = channelMeasurement::transportChannels,
                                               .rows = channelMeasurement::transportRows,
                                               .isSilent = true};

// Stays empty, whatever the GSM neighbour record says.
inline constexpr std::array gsmCodes{gsmNeighborCells::logCode};
inline constexpr ListSection gsmCells{.name = "GSM Neighbor Cell List",
                                      .trace = "GSM Neighbor Cell List",
                                      .logCodes = gsmCodes,
                                      .logCode = gsmNeighborCells::logCode,
                                      .minimumLength = gsmNeighborCells::minimumLength,
                                      .list = gsmNeighborCells::cells,
                                      .rows = gsmNeighborCells::rows,
                                      .staysEmpty = true,
                                      .isSilent = true};

}  // namespace utranTables

using GSMNeighbhorMeasurements = ListTable<utranTables::gsmCells>;
using TRCHBLERMeasurement = ListTable<utranTables::transportChannels>;

}  // namespace kelvasi
