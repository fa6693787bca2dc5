// SPDX-License-Identifier: Apache-2.0
// The text tables of the mobility-management records, typed a second time.
#include <gtest/gtest.h>

#include <array>

#include "LogGenerator/GSM/GSMTables.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

template <typename Decoder>
std::string shownAt(LogCode code, std::size_t byte, unsigned value, const std::string& key) {
  auto section = test::SectionFixture<Decoder>::rows();
  Bytes bytes = test::record(code, "", 16);
  bytes[byte] = static_cast<std::uint8_t>(value);
  section.take(bytes);
  return *section.section.dictionary()->get(key).string();
}

template <typename Decoder, std::size_t Count>
void expectTable(LogCode code, std::size_t byte, const std::string& key,
                 const std::array<const char*, Count>& texts) {
  for (unsigned value = 0; value <= 0xFF; ++value) {
    EXPECT_EQ(shownAt<Decoder>(code, byte, value, key), value < Count ? texts[value] : "Unknown")
        << key << value;
  }
}

TEST(ProcessCS, ShowsTheWholeTableOfStates) {
  expectTable<ProcessCS>(0x7131, 13, "MM State",
                         std::array{"MM_NULL",
                                    "Unknown",
                                    "Unknown",
                                    "MM_LOCATION_UPDATE_INITIATED",
                                    "Unknown",
                                    "MM_WAIT_FOR_OUTGOING_MM_CONNECTION",
                                    "MM_CONNECTION_ACTIVE",
                                    "MM_IMSI_DETACH_INITIATED",
                                    "MM_PROCESS_CM_SERVICE_PROMPT",
                                    "MM_WAIT_FOR_NETWORK_COMMAND",
                                    "MM_LOCATION_UPDATE_REJECTED",
                                    "Unknown",
                                    "Unknown",
                                    "MM_WAIT_FOR_RR_CONNECTION_LU",
                                    "MM_WAIT_FOR_RR_CONNECTION_MM",
                                    "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH",
                                    "Unknown",
                                    "MM_REESTABLISHMENT_INITIATED",
                                    "MM_WAIT_FOR_RR_ACTIVE",
                                    "MM_IDLE",
                                    "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION",
                                    "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT",
                                    "MM_WAIT_FOR_REESTABLISH_DECISION",
                                    "MM_LOCATION_UPDATING_PENDING",
                                    "Unknown",
                                    "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"});
}

TEST(ProcessCS, ShowsTheWholeTableOfSubStates) {
  expectTable<ProcessCS>(
      0x7131, 14, "MM Sub State",
      std::array{"MM_NULL_SUBSTATE", "MM_NO_IMSI", "MM_PLMN_SEARCH", "MM_LIMITED_SERVICE",
                 "MM_ATTEMPTING_TO_UPDATE", "MM_LOCATION_UPDATE_NEEDED", "MM_NO_CELL_AVAILABLE",
                 "MM_PLMN_SEARCH_NORMAL_SERVICE", "MM_NORMAL_SERVICE"});
}

TEST(ProcessCS, ShowsTheWholeTableOfUpdateStatuses) {
  expectTable<ProcessCS>(
      0x7131, 15, "LU Reject Cause",
      std::array{"UPDATED", "NOT_UPDATED", "ROAMING_NOT_ALLOWED", "LOCATION_AREA_NOT_ALLOWED"});
}

TEST(ProcessPS, ShowsTheWholeTableOfStates) {
  expectTable<ProcessPS>(0x7130, 13, "MM State",
                         std::array{"GMM_NULL", "GMM_DEREGISTERED", "GMM_REGISTERED_INITIATED",
                                    "GMM_REGISTERED", "GMM_DEREGISTERED_INITIATED",
                                    "GMM_ROUTING_AREA_UPDATE_INITIATED", "GMM_SERVICE_REQUEST_INITIATED"});
}

TEST(ProcessPS, ShowsTheWholeTableOfSubStates) {
  expectTable<ProcessPS>(
      0x7130, 14, "MM Sub State",
      std::array{"GMM_NORMAL_SERVICE", "GMM_LIMITED_SERVICE", "GMM_ATTACH_NEEDED", "GMM_ATTEMPTING_TO_ATTACH",
                 "GMM_NO_IMSI", "GMM_NO_CELL_AVAILABLE", "GMM_PLMN_SEARCH", "GMM_SUSPENDED",
                 "GMM_UPDATE_NEEDED", "GMM_ATTEMPING_TO_UPDATE", "GMM_ATTEMPTING_TO_UPDATE_MM",
                 "GMM_IMSI_DETACH_INITIATED", "GMM_NULL_SUBSTATE"});
}

TEST(ProcessPS, ShowsTheWholeTableOfUpdateStatuses) {
  expectTable<ProcessPS>(0x7130, 15, "Attach Reject Cause",
                         std::array{"GMM_GU1_UPDATED", "GMM_GU2_NOT_UPDATED", "GMM_GU3_PLMN_NOT_ALLOWED",
                                    "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"});
}

}  // namespace
}  // namespace kelvasi
