// SPDX-License-Identifier: Apache-2.0
// What our readers accept, the library that writes for us reads as the same.
#include <gtest/gtest.h>

#include <random>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/LibplistOracle.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using testing::canonical;
using testing::PlistSamples;
using testing::readWithLibplist;
using testing::textOf;

constexpr std::uint64_t samples = 300;

// How many of the sample's damaged copies are still property lists, to both.
int compareDamaged(const Bytes& document, std::mt19937_64& random) {
  int accepted = 0;
  for (int copy = 0; copy < 40; ++copy) {
    Bytes damaged = document;
    damaged[random() % damaged.size()] = static_cast<std::uint8_t>(random() % 128);
    const auto ours = LibplistSerialiser().parse(damaged);
    if (!ours || textOf(damaged).find("<key/>") != std::string::npos) continue;
    const auto theirs = readWithLibplist(damaged);
    if (!theirs) continue;  // it refuses a text of no 16-bit units, which is as good as any
    ++accepted;
    EXPECT_EQ(canonical(*theirs), canonical(*ours)) << textOf(damaged);
  }
  return accepted;
}

int compareAll(std::optional<Bytes> (LibplistSerialiser::*write)(const PlistValue&) const) {
  int accepted = 0;
  std::mt19937_64 random(1);
  for (std::uint64_t seed = 0; seed < samples; ++seed) {
    const auto document = (LibplistSerialiser().*write)(PlistSamples(seed).value());
    if (!document) continue;
    const auto ours = LibplistSerialiser().parse(*document);
    const auto theirs = readWithLibplist(*document);
    EXPECT_TRUE(ours) << seed;
    EXPECT_EQ(theirs ? canonical(*theirs) : "nothing", ours ? canonical(*ours) : "nothing") << seed;
    accepted += compareDamaged(*document, random);
  }
  return accepted;
}

TEST(Oracle, ReadsTheSameXml) {
  EXPECT_GT(compareAll(&LibplistSerialiser::serialiseXml), 1000);
}

TEST(Oracle, ReadsTheSameBinary) {
  EXPECT_GT(compareAll(&LibplistSerialiser::serialiseBinary), 1000);
}

}  // namespace
}  // namespace kelvasi
