// SPDX-License-Identifier: Apache-2.0
// A document written over what another one gave.
#include <gtest/gtest.h>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using testing::bytesOf;
using testing::canonical;
using testing::PlistSamples;
using testing::xmlPlist;

bool readOver(PlistValue& value, std::string_view body) {
  return LibplistSerialiser().parseOver(value, bytesOf(xmlPlist(body)));
}

TEST(ParseOver, UsesTheSameContainersAgain) {
  PlistValue value;
  ASSERT_TRUE(readOver(value, "<array><dict><key>a</key><string>one</string></dict></array>"));
  const PlistArray* array = value.array();
  const PlistDictionary* dictionary = array->at(0).dictionary();
  ASSERT_TRUE(readOver(value, "<array><dict><key>a</key><integer>2</integer></dict></array>"));
  EXPECT_EQ(value.array(), array);
  EXPECT_EQ(array->at(0).dictionary(), dictionary);
  EXPECT_EQ(canonical(value), canonical(PlistArray::make({PlistDictionary::make({{"a", 2}})})));
}

TEST(ParseOver, LeavesWhatOthersHold) {
  PlistValue value;
  ASSERT_TRUE(readOver(value, "<array><array><string>one</string></array><string>x</string></array>"));
  const PlistValue inner = value.array()->at(0);
  ASSERT_TRUE(readOver(value, "<array><array><string>two</string></array></array>"));
  EXPECT_EQ(inner, PlistValue(PlistArray::make({"one"})));
  const PlistValue outer = value;
  ASSERT_TRUE(readOver(value, "<array/>"));
  EXPECT_EQ(outer, PlistValue(PlistArray::make({PlistArray::make({"two"})})));
  EXPECT_TRUE(value.array()->empty());
}

TEST(ParseOver, DropsWhatTheDocumentHasNot) {
  PlistValue value;
  ASSERT_TRUE(readOver(value, "<dict><key>a</key><true/><key>b</key><true/><key>c</key><true/></dict>"));
  ASSERT_TRUE(readOver(value, "<dict><key>a</key><true/><key>c</key><false/></dict>"));
  EXPECT_EQ(canonical(value), canonical(PlistDictionary::make({{"a", true}, {"c", false}})));
}

TEST(ParseOver, KeepsTheLastOfEqualKeysAtTheFirstPlace) {
  PlistValue value;
  ASSERT_TRUE(readOver(value, "<dict><key>a</key><true/><key>b</key><true/></dict>"));
  ASSERT_TRUE(readOver(
      value, "<dict><key>a</key><true/><key>b</key><true/><key>a</key><false/><key>c</key><true/></dict>"));
  EXPECT_EQ(canonical(value), canonical(PlistDictionary::make({{"a", false}, {"b", true}, {"c", true}})));
}

TEST(ParseOver, LeavesNothingOfWhatIsRefused) {
  PlistValue value;
  ASSERT_TRUE(readOver(value, "<array><string>one</string></array>"));
  EXPECT_FALSE(readOver(value, "<array><string>two</string><unknown/></array>"));
  EXPECT_TRUE(value.isAbsent());
}

TEST(ParseOver, GivesWhatReadingAnewGives) {
  const LibplistSerialiser plists;
  PlistValue value;
  int read = 0;
  for (std::uint64_t seed = 0; seed < 200; ++seed) {
    const auto document = plists.serialiseXml(PlistSamples(seed % 40).value());
    if (!document) continue;
    ++read;
    ASSERT_TRUE(plists.parseOver(value, *document)) << seed;
    EXPECT_EQ(canonical(value), canonical(*plists.parse(*document))) << seed;
  }
  EXPECT_GT(read, 100);
}

}  // namespace
}  // namespace kelvasi
