// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/EntryList.h"

#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/GSM/BSICList.h"
#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/HARQStatistics.h"
#include "LogGenerator/GSM/NeighbourSets.h"
#include "LogGenerator/GSM/TransportChannelCRC.h"
#include "LogGenerator/GSM/UMTSRRRecords.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

struct Countable {
  const char* name;
  EntryList list;
};

TEST(EntryList, AnIndexAtOrPastTheRecordsOwnCountThrows) {
  const Countable lists[] = {{"identities", cellSets::identities},
                             {"energies", cellSets::energies},
                             {"UMTS cells", neighbourSets::umtsCells},
                             {"GSM cells", neighbourSets::gsmCells},
                             {"samples", transmitPower::samples},
                             {"neighbours", gsmMeasurements::neighbours},
                             {"BSICs", bsicList::cells},
                             {"primary", harqStatistics::primary},
                             {"secondary", harqStatistics::secondary},
                             {"channels", transportChannelCrc::channels}};
  Bytes bytes(400, 2);
  const RecordView record(bytes);
  for (const auto& [name, list] : lists) {
    EXPECT_EQ(countOf(record, list), 2u) << name;
    EXPECT_NO_THROW(entryOf(record, list, 1)) << name;
    EXPECT_THROW(entryOf(record, list, 2), ArrayOutOfBoundsException) << name;
    EXPECT_THROW(entryOf(record, list, 255), ArrayOutOfBoundsException) << name;
  }
}

TEST(EntryList, AnEntryPastTheEndOfTheRecordReadsAsZero) {
  const Bytes bytes = test::hex("FF");
  const EntryList list{.count = Field{.name = "count", .byte = 0}, .start = 1, .stride = 2, .layout = {}};
  EXPECT_EQ(entryOf(RecordView(bytes), list, 254).u16(0), 0u);
}

}  // namespace
}  // namespace kelvasi
