// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon/SimRecord.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "LogGenerator/Daemon/SimFiles.h"
#include "LogGenerator/LogCode.h"
#include "Simulator/Daemon/PropertyListRecord.h"

namespace kelvasi::sim::gsm {

namespace {

struct File {
  std::string_view key;
  std::string_view contents;
};

constexpr std::string_view technologiesKey = "kSimFile_RATMODE";
constexpr std::string_view operatorsListKey = "kSimFile_OPLMNAcT";

// Of a subscriber of the home network, 999 01; the PLMN lists are in the coding of 3GPP TS 31.102. The last
// digit of the ICCID checks the others (ITU-T E.118).
constexpr std::array files{
    File{"kSimFile_ICCID", "8999901000000000013"},
    File{"kSimFile_MSISDN", "+99901555010"},
    File{"kSimFile_MBDN", "+99901555000"},
    File{"kSimFile_HPPLMN", "05"},
    File{"kSimFile_LOCI", "FFFFFFFF99F910FFFE0001"},
    File{"kSimFile_PSLOCI", "FFFFFFFFFFFFFF99F910FFFEFF01"},
    File{"kSimFile_ACC", "0008"},
    File{"kSimFile_AD", "00000002"},
    File{"kSimFile_FPLMN", "FFFFFFFFFFFFFFFFFFFFFFFF"},
    File{"kSimFile_AHPLMN", "99F910"},
    File{technologiesKey, {}},
    File{"kSimFile_PNN", "Test Network"},
    File{"kSimFile_OPL", "99F9100000FFFE01"},
    File{operatorsListKey, {}},
};
static_assert(std::ranges::equal(files, simFiles::files, {}, &File::key, &simFiles::SimFile::key));

}  // namespace

const SimTechnologies gsmAndUmts{.names = "GSM and UMTS", .operatorsList = "99F9208080FFFFFF0000"};
const SimTechnologies gsmUmtsAndLte{.names = "GSM, UMTS and LTE", .operatorsList = "99F920C080FFFFFF0000"};

std::optional<Bytes> simFilesRecord(const PlistSerialiser& plists, const SimTechnologies& technologies) {
  const auto contents = PlistDictionary::make();
  for (const File& file : files) contents->set(file.key, file.contents);
  contents->set(technologiesKey, technologies.names);
  contents->set(operatorsListKey, technologies.operatorsList);
  return propertyListRecord(simFilesLogCode, contents, plists);
}

}  // namespace kelvasi::sim::gsm
