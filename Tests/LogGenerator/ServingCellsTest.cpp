// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ServingCells.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

constexpr CellIdentity here{RadioFamily::umts, 10612, 362};

TEST(ServingCells, KnowsNoneBeforeARecordSaysOne) {
  EXPECT_FALSE(ServingCells().certain(RadioFamily::umts));
}

TEST(ServingCells, TakesTheLastWordOfOneKindOfRecord) {
  ServingCells cells;
  cells.say(0x4127, {.cell = {RadioFamily::umts, 10564, 1}});
  cells.say(0x4127, {.cell = here});
  EXPECT_EQ(cells.certain(RadioFamily::umts), here);
  EXPECT_FALSE(cells.certain(RadioFamily::gsm));
}

TEST(ServingCells, JoinsWhatTwoKindsOfRecordSay) {
  ServingCells cells;
  cells.say(0x4127, {.cell = {.family = RadioFamily::umts, .channel = 10612}, .cellId = 7});
  cells.say(0xFF0001, {.cell = here, .cellId = 7});
  EXPECT_EQ(cells.certain(RadioFamily::umts), here);
}

TEST(ServingCells, AreCertainOfNoneWhileTwoKindsOfRecordContradictEachOther) {
  ServingCells cells;
  cells.say(0x4127, {.cell = {.family = RadioFamily::umts, .channel = 10612}, .cellId = 8});
  cells.say(0xFF0001, {.cell = here, .cellId = 7});
  EXPECT_FALSE(cells.certain(RadioFamily::umts));  // another cell of the same channel
  cells.say(0xFF0001, {.cell = {RadioFamily::umts, 10612, 363}, .cellId = 8});
  EXPECT_EQ(textOf(cells.certain(RadioFamily::umts)), "umts:10612/363");
}

TEST(ServingCells, DropAWordThatAnotherRecordDenies) {
  ServingCells cells;
  cells.say(0x5134, {.cell = {RadioFamily::gsm, 62, 13}});
  cells.deny({.family = RadioFamily::gsm, .channel = 70});
  EXPECT_EQ(textOf(cells.certain(RadioFamily::gsm)), "gsm:62/13");
  cells.deny({.family = RadioFamily::gsm, .channel = 62});
  EXPECT_FALSE(cells.certain(RadioFamily::gsm));
}

}  // namespace
}  // namespace kelvasi
