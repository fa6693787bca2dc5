// SPDX-License-Identifier: Apache-2.0
// The SIM-file record of the telephony daemon: a property-list dictionary of elementary files (3GPP TS
// 31.102, 4.2).
#pragma once

#include <array>
#include <string_view>

namespace kelvasi::simFiles {

struct SimFile {
  std::string_view key;  // in the record
  std::string_view row;
};

inline constexpr std::array files{
    SimFile{"kSimFile_ICCID", "EF-ICCID"},
    SimFile{"kSimFile_MSISDN", "EF-MSISDN"},
    SimFile{"kSimFile_MBDN", "EF-3GPP MAIL BOX DIALING NUMBER"},
    SimFile{"kSimFile_HPPLMN", "EF-HPPLMN SEARCH PERIOD"},
    SimFile{"kSimFile_LOCI", "EF-LOCI"},
    SimFile{"kSimFile_PSLOCI", "EF-GPRS/PS-LOCI"},
    SimFile{"kSimFile_ACC", "EF-ACCESS CONTROL CLASS"},
    SimFile{"kSimFile_AD", "EF-ADMINISTRATIVE DATA"},
    SimFile{"kSimFile_FPLMN", "EF-FPLMN"},
    SimFile{"kSimFile_AHPLMN", "EF-ACTING HPLMN"},
    SimFile{"kSimFile_RATMODE", "EF-RAT MODE"},
    SimFile{"kSimFile_PNN", "EF-PLMN NETWORK NAME"},
    SimFile{"kSimFile_OPL", "EF-OPERATOR PLMN LIST"},
    SimFile{"kSimFile_OPLMNAcT", "EF-OPLMNAcT"},
};

}  // namespace kelvasi::simFiles
