// SPDX-License-Identifier: Apache-2.0
// The records of the UTRAN baseband.
#pragma once

#include <optional>

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::utran {

using gsm::World;

std::optional<Bytes> rrcStateRecord(const World& world);  // 0xD0E0
std::optional<Bytes> servingCellRecord(
    const World& world);  // 0xD0E2; nothing while GSM serves or nothing does
std::optional<Bytes> neighborCellsRecord(const World& world);     // 0xD00A
std::optional<Bytes> gsmNeighborCellsRecord(const World& world);  // 0xD00E
// 0xD00C; without channels outside a connection.
std::optional<Bytes> channelMeasurementRecord(const World& world);

// Which of the record's sets a neighbour belongs to: those near the serving cell are monitored, others are
// detected.
enum class Membership : std::uint8_t { active, monitored, detected };
Membership membershipOf(const World& world, std::size_t neighbour);
// Whether the handset detects a neighbour jointly with the serving cell: one of its carrier, hardly weaker.
bool isDetectedJointly(const World& world, std::size_t neighbour);
// Of a coded composite channel, whose power control lets it vary by timeslot; dB.
double interferenceRatio(const World& world, std::size_t timeslot);
// The level of 3GPP TS 25.123, 9.1.1.4, of a transport channel's block error rate.
int blockErrorLevel(double rate);

}  // namespace kelvasi::sim::utran
