// SPDX-License-Identifier: Apache-2.0
#include <algorithm>
#include <array>

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/Orvane_GSMLogGenerator.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/ObjectStream/GSMLogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "Telvon/Technology.h"

namespace kelvasi {

namespace {

struct Technology {
  std::string_view id;
  std::unique_ptr<LogGenerator> (*generator)(const Platform&);
};

constexpr std::array technologies{
    Technology{kTelvonLogChannelTechnology_IFX, GSMLogGenerator::generator},
    Technology{kTelvonLogChannelTechnology_Orvane_GSM, Orvane_GSMLogGenerator::generator},
    Technology{kTelvonLogChannelTechnology_Orvane_CDMA, C2KLogGenerator::generator},
    Technology{kTelvonLogChannelTechnology_Orvane_LTE, LTELogGenerator::generator},
    Technology{kTelvonLogChannelTechnology_Orvane_UTRAN2, UTRANLogGenerator::generator},
};

}  // namespace

std::unique_ptr<LogGenerator> LogGenerator::generatorFromTechnology(std::string_view technology,
                                                                    const Platform& platform) {
  const auto known = std::ranges::find(technologies, technology, &Technology::id);
  return known == technologies.end() ? nullptr : known->generator(platform);
}

}  // namespace kelvasi
