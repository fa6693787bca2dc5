// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/DissectorConstants.h"

#include <span>

#include "LogGenerator/C2K/ActiveSet1x.h"
#include "LogGenerator/C2K/DeviceStatus.h"
#include "LogGenerator/C2K/EvdoRates.h"
#include "LogGenerator/C2K/EvdoStatus.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/C2K/SystemParameters.h"
#include "LogGenerator/C2K/TrafficFER.h"
#include "LogGenerator/EcnoLadder.h"
#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/LTE/ReselectionCandidates.h"
#include "LogGenerator/UTRAN/ChannelMeasurement.h"
#include "LogGenerator/UTRAN/RRCState.h"
#include "Tools/Kelvasictl/Dissector/DissectorRow.h"

namespace kelvasi {

namespace {

std::string number(auto value) {
  return luaNumber(static_cast<double>(value));
}

std::string numbers(std::span<const std::int64_t> values) {
  LuaTable table;
  for (const std::int64_t value : values) table.addNumber(static_cast<double>(value));
  return table.written();
}

std::string ecnoSteps() {
  LuaTable steps;
  for (const EcnoStep& step : ecnoLadder)
    steps.add(LuaTable().addNumber(step.from).addNumber(step.decibels).written());
  return steps.written();
}

std::string reverseRate() {
  using namespace evdoReverseRate;
  LuaTable table;
  table.set("first", number(firstCounter)).set("weights", numbers(weights));
  table.set("sub_frames", number(subFrames)).set("sub_frame_step", number(subFrameStep));
  table.set("halves", number(halves)).set("half_step", number(halfStep)).set("rate_step", number(rateStep));
  return table.set("counters", number(counters)).set("counter_step", number(counterStep)).written();
}

std::string forwardRate() {
  using namespace evdoForwardRate;
  return LuaTable().set("first", number(firstCounter)).set("weights", numbers(weights)).written();
}

std::string subPacketConstants() {
  LuaTable table;
  table.set("first", number(subPackets::first)).set("count", luaField(fieldIn(subPackets::layout, "count")));
  table.set("id", luaField(fieldIn(subPackets::headerLayout, "id")));
  return table.set("size", luaField(fieldIn(subPackets::headerLayout, "size"))).written();
}

std::string deviceStatusConstants() {
  using namespace deviceStatus;
  LuaTable table;
  table.set("state", number(stateId)).set("radio", number(radioId)).set("active_set", number(activeSetId));
  table.set("fingers", number(fingersId)).set("traffic_state", number(trafficState));
  return table.setText("before_reference", activeSet1xRows.back().before).written();
}

std::string trafficFERConstants() {
  using namespace trafficFER;
  LuaTable table;
  table.set("demodulation", number(demodulationId));
  return table.set("new", number(newFrameWeight)).set("old", number(oldRateWeight)).written();
}

}  // namespace

std::string dissectorConstants() {
  LuaTable table;
  table.set("ecno_steps", ecnoSteps()).breakLine();
  table.set("active_set_member", number(cellSets::activeSetMember));
  table.set("rat_specific", number(lte::reselectionCandidates::ratSpecific));
  table.set("rrc_version", number(utran::rrcState::knownVersion));
  table.set("timeslots", number(utran::channelMeasurement::timeslots)).breakLine();
  table.set("no_pilot", number(noPilot)).set("evdo_access_state", number(evdoStatus::accessState));
  table.set("system_version", number(systemParameters::minimumVersion));
  table.set("cdma_system", number(systemParameters::cdmaSystem)).breakLine();
  table.set("sub_packets", subPacketConstants()).set("device_status", deviceStatusConstants()).breakLine();
  table.set("traffic_fer", trafficFERConstants()).breakLine();
  table.set("forward_rate", forwardRate()).breakLine().set("reverse_rate", reverseRate());
  return "tables.constants = " + table.written() + "\n";
}

}  // namespace kelvasi
