// SPDX-License-Identifier: Apache-2.0
#include "Redaction/NameBook.h"

#include <gtest/gtest.h>

#include <array>

namespace kelvasi {
namespace {

constexpr std::array rows{Row{.key = "Cell ID", .quantity = quantity::cellId},
                          Row{.key = "Serving Cell ID", .quantity = quantity::pci}};

NameBook book() {
  RowCatalog catalog;
  catalog.add({.section = "Serving Cell", .key = "Cell ID", .row = &rows[0], .source = "kCellId"});
  catalog.add({.section = "Candidates", .key = "Cell ID", .row = &rows[1]});
  NameBook learned;
  learned.learn(catalog);
  return learned;
}

std::optional<Identifies> of(std::vector<std::string> path) {
  const auto value = book().of(path);
  return value ? std::optional(value->identifies) : std::nullopt;
}

TEST(NameBook, KnowsRowsByTheirSection) {
  EXPECT_EQ(of({"02;GSM", "Serving Cell", "Cell ID"}), Identifies::place);
  EXPECT_EQ(of({"Candidates", "", "Cell ID"}), Identifies::nothing);
  EXPECT_EQ(of({"", "kCellId"}), Identifies::place);
}

TEST(NameBook, KnowsIdentitiesByWordsInTheirNames) {
  EXPECT_EQ(of({"kSimFile_ICCID"}), Identifies::subscriber);
  EXPECT_EQ(of({"Subscriber's I.M.S.I."}), Identifies::subscriber);
  EXPECT_EQ(of({"PDP Address"}), Identifies::subscriber);
  EXPECT_EQ(of({"Tracking Area Code"}), Identifies::place);
  EXPECT_EQ(of({"EF-PLMN NETWORK NAME"}), Identifies::nothing);
  EXPECT_EQ(of({"Colour"}), std::nullopt);
}

TEST(NameBook, WhatANameHoldsIsAsItSays) {
  EXPECT_EQ(of({"PDP Address", "", "Colour"}), Identifies::subscriber);
}

TEST(NameBook, TextsThatCouldNameSomebody) {
  for (const char* text : {"12345", "+49 170 1", "a@b", "10.0.0.1", "00:1A:2B", "call (030) 12-34"})
    EXPECT_TRUE(couldIdentify(text)) << text;
  for (const char* text : {"", "1234", "-101.25 dBm", "MM_IDLE", "2024-03-05 14:07:09 +0000", "1.2",
                           "a: b: c", "Snapshot (2024-03-05 14:07:09)", "1234 and 5678"})
    EXPECT_FALSE(couldIdentify(text)) << text;
}

}  // namespace
}  // namespace kelvasi
