// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/GSM/GSMSamples.h"

#include "LogGenerator/Daemon/SimFiles.h"
#include "LogGenerator/GSM/BSICList.h"
#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/GSM/EquivalentPLMN.h"
#include "LogGenerator/GSM/GMMState.h"
#include "LogGenerator/GSM/GPRSCellOptions.h"
#include "LogGenerator/GSM/GPRSRecords.h"
#include "LogGenerator/GSM/GSMCellRecords.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/GSMRRRecords.h"
#include "LogGenerator/GSM/HARQStatistics.h"
#include "LogGenerator/GSM/HoppingList.h"
#include "LogGenerator/GSM/MMState.h"
#include "LogGenerator/GSM/NeighbourSets.h"
#include "LogGenerator/GSM/RegisteredPLMN.h"
#include "LogGenerator/GSM/RegistrationState.h"
#include "LogGenerator/GSM/TransportChannelCRC.h"
#include "LogGenerator/GSM/UMTSRRRecords.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi::bench {

namespace {

PlistValue cell(std::string_view type, Random& random) {
  const auto entry = PlistDictionary::make();
  entry->set(kTelvonCellMonitorCellRadioAccessTechnology, kTelvonCellMonitorRadioAccessTechnologyUMTS);
  entry->set(kTelvonCellMonitorCellType, type);
  entry->set(kTelvonCellMonitorMCC, 262);
  entry->set(kTelvonCellMonitorMNC, 1 + random.below(9));
  entry->set(kTelvonCellMonitorLAC, random.below(65536));
  entry->set(kTelvonCellMonitorCellId, random.below(1 << 28));
  entry->set(kTelvonCellMonitorUARFCN, 10562 + random.below(277));
  entry->set(kTelvonCellMonitorSCN, random.below(512));
  entry->set(kTelvonCellMonitorRSCP, random.below(92));
  entry->set(kTelvonCellMonitorECN0, random.below(50));
  return entry;
}

PlistValue cellList(Random& random) {
  const auto cells = PlistArray::make({cell(kTelvonCellMonitorCellTypeServing, random)});
  while (cells->size() < 7) cells->append(cell(kTelvonCellMonitorCellTypeNeighbor, random));
  return cells;
}

PlistValue dataContexts(Random& random) {
  return PlistArray::make({PlistDictionary::make(
      {{"APN", "internet"}, {"State", random.below(2) == 0 ? "Active" : "Inactive"}})});
}

PlistValue simFileTexts(Random& random) {
  const auto texts = PlistDictionary::make();
  for (const simFiles::SimFile& file : simFiles::files)
    texts->set(file.key, std::to_string(random.below(1u << 31)));
  return texts;
}

// A record that a section shows row by row.
constexpr Sample rows(std::string_view name, const RecordRows& record,
                      std::uint64_t below = std::numeric_limits<std::uint64_t>::max()) {
  return {name, record.logCode, record.minimumLength, record.layout, below};
}

}  // namespace

std::span<const Sample> gsmSamples() {
  static constexpr std::array samples{
      Sample{.name = "0x7130 GMM state",
             .logCode = gmmState::logCode,
             .length = gmmState::minimumLength,
             .layout = gmmState::layout,
             .below = 7},
      Sample{.name = "0x7131 MM state",
             .logCode = mmState::logCode,
             .length = mmState::minimumLength,
             .layout = mmState::layout,
             .below = 9},
      Sample{.name = "0x7132 registration",
             .logCode = registrationState::logCode,
             .length = registrationState::minimumLength,
             .layout = registrationState::layout,
             .below = 5},
      Sample{.name = "0x7135 registered PLMN",
             .logCode = registeredPlmn::logCode,
             .length = registeredPlmn::minimumLength,
             .layout = registeredPlmn::layout,
             .below = 10},
      Sample{.name = "0x7150 4 equivalent PLMNs",
             .logCode = equivalentPlmn::logCode,
             .length = equivalentPlmn::minimumLength,
             .layout = equivalentPlmn::layout,
             .below = 10,
             .lists = {{{equivalentPlmn::plmns, 4}}}},
      rows("0x5134 cell identity", gsmCellIdentity::record),
      rows("0x5076 dedicated channel", dedicatedChannel::record),
      rows("0x512C RR state", rrState::record, 22),
      rows("0x5072 DTX", dtx::record, 2),
      rows("0x51F4 SI13", si13::record, 2),
      rows("0x51F5 packet access", packetAccess::record, 3),
      rows("0x51FB PBCCH", pbcch::record),
      rows("0x51FD packet status", packetStatus::record, 2),
      rows("0x4125 RRC state", rrcState::record, 6),
      rows("0x4157 ciphering", ciphering::record, 2),
      Sample{.name = "0x51F6 cell options",
             .logCode = gprsCellOptions::logCode,
             .length = gprsCellOptions::minimumLength,
             .layout = gprsCellOptions::layout,
             .below = 8},
      Sample{.name = "0x5137 6 measured neighbours",
             .logCode = gsmMeasurements::logCode,
             .length = gsmMeasurements::minimumLength,
             .layout = gsmMeasurements::layout,
             .lists = {{{gsmMeasurements::neighbours, 6}}}},
      Sample{.name = "0x51FF 6 BSICs",
             .logCode = bsicList::logCode,
             .length = bsicList::minimumLength,
             .layout = bsicList::layout,
             .lists = {{{bsicList::cells, 6}}}},
      Sample{.name = "0x51F8 8 hopping ARFCNs",
             .logCode = hoppingList::logCode,
             .length = hoppingList::minimumLength,
             .layout = hoppingList::layout,
             .lists = {{{hoppingList::frequencies, 8}}}},
      Sample{.name = "0x4127 UMTS serving cell",
             .logCode = umtsServingCell::logCode,
             .length = umtsServingCell::minimumLength,
             .layout = umtsServingCell::layout},
      Sample{.name = "0x4031 4 transmit power samples",
             .logCode = transmitPower::logCode,
             .length = transmitPower::minimumLength,
             .layout = transmitPower::layout,
             .lists = {{{transmitPower::samples, 4}}}},
      Sample{.name = "0x4005 6 UMTS, 4 GSM neighbours",
             .logCode = neighbourSets::logCode,
             .length = neighbourSets::minimumLength,
             .layout = neighbourSets::layout,
             .lists = {{{neighbourSets::umtsCells, 6}, {neighbourSets::gsmCells, 4}}}},
      Sample{.name = "0x4116 4 transport channels",
             .logCode = transportChannelCrc::logCode,
             .length = transportChannelCrc::minimumLength,
             .layout = transportChannelCrc::layout,
             .lists = {{{transportChannelCrc::channels, 4}}}},
      Sample{.name = "0x4221 6 and 2 HARQ processes",
             .logCode = harqStatistics::logCode,
             .length = harqStatistics::minimumLength,
             .layout = harqStatistics::layout,
             .lists = {{{harqStatistics::primary, 6}, {harqStatistics::secondary, 2}}}},
      Sample{.name = "0x417A 6 cells of the sets",
             .logCode = cellSets::logCode,
             .length = cellSets::minimumLength,
             .layout = cellSets::layout,
             .lists = {{{cellSets::identities, 6}, {cellSets::energies, 6}}}},
      Sample{.name = "cell list of 7 (daemon)", .logCode = cellInfoLogCode, .payload = cellList},
      Sample{.name = "PDP contexts (daemon)", .logCode = pdpContextLogCode, .payload = dataContexts},
      Sample{.name = "SIM files (daemon)", .logCode = simFilesLogCode, .payload = simFileTexts},
  };
  return samples;
}

}  // namespace kelvasi::bench
