// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using testing::canonical;
using testing::PlistSamples;

constexpr std::uint64_t seeds = 2000;

TEST(RoundTrip, ThroughXmlKeepsEveryValueAndItsOrder) {
  const LibplistSerialiser serialiser;
  for (std::uint64_t seed = 0; seed < seeds; ++seed) {
    const PlistValue value = PlistSamples(seed).value();
    const auto bytes = serialiser.serialiseXml(value);
    ASSERT_TRUE(bytes) << "seed " << seed;
    const auto again = serialiser.parse(*bytes);
    ASSERT_TRUE(again) << "seed " << seed;
    ASSERT_EQ(canonical(*again), canonical(value)) << "seed " << seed;
  }
}

TEST(RoundTrip, ThroughTheBinaryFormatKeepsEveryValueAndItsOrder) {
  const LibplistSerialiser serialiser;
  for (std::uint64_t seed = 0; seed < seeds; ++seed) {
    const PlistValue value = PlistSamples(seed).value();
    const auto bytes = serialiser.serialiseBinary(value);
    ASSERT_TRUE(bytes) << "seed " << seed;
    const auto again = serialiser.parse(*bytes);
    ASSERT_TRUE(again) << "seed " << seed;
    ASSERT_EQ(canonical(*again), canonical(value)) << "seed " << seed;
  }
}

TEST(RoundTrip, SamplesCoverEveryKind) {
  std::string all;
  for (std::uint64_t seed = 0; seed < 100; ++seed) all += canonical(PlistSamples(seed).value());
  for (const char* kind : {"s", "i", "r", "true", "false", "t4", "d", "[", "{"}) {
    EXPECT_NE(all.find(kind), std::string::npos) << kind;
  }
}

}  // namespace
}  // namespace kelvasi
