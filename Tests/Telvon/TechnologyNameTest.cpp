// SPDX-License-Identifier: Apache-2.0
#include "Telvon/TechnologyName.h"

#include <gtest/gtest.h>

#include "Telvon/Technology.h"

namespace kelvasi {
namespace {

TEST(TechnologyName, IsTheShortOneOrTheWholeId) {
  EXPECT_EQ(technologyId("IFX"), kTelvonLogChannelTechnology_IFX);
  EXPECT_EQ(technologyId("Orvane_GSM"), kTelvonLogChannelTechnology_Orvane_GSM);
  EXPECT_EQ(technologyId("Orvane_CDMA"), kTelvonLogChannelTechnology_Orvane_CDMA);
  EXPECT_EQ(technologyId("Orvane_LTE"), kTelvonLogChannelTechnology_Orvane_LTE);
  EXPECT_EQ(technologyId("Orvane_UTRAN2"), kTelvonLogChannelTechnology_Orvane_UTRAN2);
  EXPECT_EQ(technologyId("kTelvonLogChannelTechnology_IFX"), kTelvonLogChannelTechnology_IFX);
}

TEST(TechnologyName, IsExact) {
  for (const char* name : {"", "orvane_gsm", "Orvane", "kTelvonLogChannelTechnology_", "IFX "})
    EXPECT_EQ(technologyId(name), std::nullopt) << name;
}

TEST(TechnologyName, IsShortenedForPeople) {
  EXPECT_EQ(shortTechnologyName(kTelvonLogChannelTechnology_Orvane_LTE), "Orvane_LTE");
  EXPECT_EQ(shortTechnologyName("something"), "something");
}

}  // namespace
}  // namespace kelvasi
