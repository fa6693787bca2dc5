// SPDX-License-Identifier: Apache-2.0
#include "Model/SnapshotFile.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

constexpr PlistDate moment{1709647629.75};  // 2024-03-05 14:07:09 UTC

std::string keys(const PlistDictionary& dictionary) {
  std::string text;
  for (const auto& [key, value] : dictionary) text += key + " ";
  return text;
}

TEST(SnapshotFile, HoldsTimestampDataAndDescriptionInThisOrder) {
  const PlistValue data = PlistArray::make({"entry"});
  const auto snapshot = snapshotDictionary(moment, data, "text");
  EXPECT_EQ(keys(*snapshot), "Timestamp Data Description ");
  EXPECT_EQ(snapshot->get("Timestamp"), "2024-03-05 14:07:09 +0000");
  EXPECT_EQ(snapshot->get("Data"), data);
  EXPECT_EQ(snapshot->get("Description"), "text");
}

TEST(SnapshotFile, TheFirstMissingValueEndsTheList) {
  EXPECT_EQ(keys(*snapshotDictionary(moment, PlistArray::make(), std::nullopt)), "Timestamp Data ");
  EXPECT_EQ(keys(*snapshotDictionary(moment, PlistValue(), "text")), "Timestamp ");
}

TEST(SnapshotFile, AnEmptyDescriptionIsNotAMissingOne) {
  EXPECT_EQ(keys(*snapshotDictionary(moment, PlistArray::make(), "")), "Timestamp Data Description ");
}

TEST(SnapshotFile, ThePathNamesWholeSecondsSinceTheEpoch) {
  EXPECT_EQ(snapshotPath("/logs", moment), "/logs/KelvasiSnapshot-1709647629.kelvasi");
}

}  // namespace
}  // namespace kelvasi
