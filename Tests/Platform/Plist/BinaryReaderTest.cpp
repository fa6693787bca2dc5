// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/BinaryReader.h"

#include <gtest/gtest.h>

#include <bit>

#include "Platform/Plist/PlistLimits.h"
#include "Tests/Platform/Plist/BinaryDocument.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using testing::BinaryDocument;
using testing::bytesOf;

bool reads(std::span<const std::uint8_t> document) {
  return readBinaryPlist(document).has_value();
}

bool isSafeAlone(const Bytes& object) {
  return reads(BinaryDocument().add(object).bytes());
}

// `levels` arrays around one another, each referring `times` times to the next, a boolean innermost.
Bytes nested(std::uint16_t levels, int times = 1) {
  BinaryDocument document;
  for (std::uint16_t level = 1; level <= levels; ++level) {
    times == 1 ? document.addArray({level}) : document.addArray({level, level});
  }
  return document.add({0x09}).bytes();
}

// An array of `count` references to object 1, whose bytes are given.
Bytes repeated(std::uint16_t count, const Bytes& object) {
  Bytes array{0xaf, 0x11, static_cast<std::uint8_t>(count >> 8), static_cast<std::uint8_t>(count & 0xff)};
  for (int place = 0; place < count; ++place) array.insert(array.end(), {0, 1});
  return BinaryDocument().add(array).add(object).bytes();
}

// A dictionary whose keys and values are all object `number`.
Bytes dictionaryOf(std::size_t entries, std::uint8_t number) {
  Bytes object{0xdf, 0x11, static_cast<std::uint8_t>(entries >> 8),
               static_cast<std::uint8_t>(entries & 0xff)};
  for (std::size_t place = 0; place < 2 * entries; ++place) object.insert(object.end(), {0, number});
  return object;
}

TEST(BinaryReader, AcceptsEveryKind) {
  EXPECT_TRUE(reads(BinaryDocument()
                        .addDictionary({1, 2, 3, 4})
                        .addText("a")
                        .add({0x61, 0x6f, 0x22})  // a key of one 16-bit unit
                        .addArray({5, 6, 7, 8})
                        .add({0x42, 0, 1})
                        .add({0x08})
                        .add({0x13, 0, 0, 0, 0, 0, 0, 0, 1})
                        .add({0x22, 0x3f, 0x80, 0, 0})
                        .add({0x33, 0, 0, 0, 0, 0, 0, 0, 0})
                        .bytes()));
}

TEST(BinaryReader, AcceptsALengthInAnIntegerOfItsOwn) {
  EXPECT_TRUE(isSafeAlone({0x4f, 0x10, 2, 7, 7}));
  EXPECT_TRUE(isSafeAlone({0x4f, 0x13, 0, 0, 0, 0, 0, 0, 0, 2, 7, 7}));
  EXPECT_FALSE(isSafeAlone({0x4f, 0x10, 3, 7, 7}));
  EXPECT_FALSE(isSafeAlone({0x4f, 0x13, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 7}));
  EXPECT_FALSE(isSafeAlone({0x4f, 0x14, 2, 7, 7}));
  EXPECT_FALSE(isSafeAlone({0x4f, 0x09, 2, 7, 7}));
  EXPECT_FALSE(isSafeAlone({0x4f, 0x11, 2}));
  EXPECT_FALSE(isSafeAlone({0x4f}));
}

TEST(BinaryReader, RefusesKindsThatAreNoValues) {
  for (const std::uint8_t kind : Bytes{0x00, 0x01, 0x0a, 0x0f, 0x70, 0x80, 0x90, 0xb0, 0xc0, 0xe0, 0xf0}) {
    EXPECT_FALSE(isSafeAlone({kind, 0, 0, 0, 0, 0, 0, 0, 0, 0})) << int{kind};
  }
}

TEST(BinaryReader, NumbersAreOfTheSizesThereAre) {
  for (const unsigned size : {1u, 2u, 4u, 8u}) {
    Bytes integer(1 + size, 1);
    integer[0] = static_cast<std::uint8_t>(0x10 + std::bit_width(size) - 1);
    EXPECT_TRUE(isSafeAlone(integer)) << size;
    integer.pop_back();
    EXPECT_FALSE(isSafeAlone(integer)) << size;
  }
  EXPECT_TRUE(isSafeAlone({0x14, 0, 0, 0, 0, 0, 0, 0, 0, 1, 2, 3, 4, 5, 6, 7, 8}));
  EXPECT_FALSE(isSafeAlone({0x14, 0, 0, 0, 0, 0, 0, 0, 1, 1, 2, 3, 4, 5, 6, 7, 8}));
  EXPECT_FALSE(isSafeAlone(Bytes(33, 0x15)));
  EXPECT_TRUE(isSafeAlone({0x23, 0, 0, 0, 0, 0, 0, 0, 0}));
  EXPECT_FALSE(isSafeAlone({0x23, 0, 0, 0, 0, 0, 0, 0}));
  EXPECT_FALSE(isSafeAlone({0x21, 0, 0}));
  EXPECT_FALSE(isSafeAlone({0x32, 0, 0, 0, 0}));
}

TEST(BinaryReader, DatesAreFinite) {
  EXPECT_FALSE(isSafeAlone({0x33, 0x7f, 0xf0, 0, 0, 0, 0, 0, 0}));
  EXPECT_FALSE(isSafeAlone({0x33, 0x7f, 0xf8, 0, 0, 0, 0, 0, 0}));
}

TEST(BinaryReader, TextsAreUnicodeWithoutNul) {
  EXPECT_TRUE(isSafeAlone({0x52, 0xc3, 0xa9}));
  EXPECT_FALSE(isSafeAlone({0x52, 0xc3, '('}));
  EXPECT_FALSE(isSafeAlone({0x53, 'a', 0, 'b'}));
  EXPECT_TRUE(isSafeAlone({0x62, 0xd8, 0x3d, 0xde, 0x00}));  // a pair of surrogates
  EXPECT_FALSE(isSafeAlone({0x61, 0xd8, 0x3d}));             // half of one
  EXPECT_FALSE(isSafeAlone({0x62, 0xd8, 0x3d, 0, 'a'}));     // half of one
  EXPECT_FALSE(isSafeAlone({0x61, 0xde, 0x00}));             // the other half
  EXPECT_FALSE(isSafeAlone({0x62, 0, 'a', 0, 0}));
  EXPECT_FALSE(isSafeAlone({0x62, 0, 'a', 0}));
}

TEST(BinaryReader, KeysAreStrings) {
  EXPECT_FALSE(reads(BinaryDocument().addDictionary({1, 1}).add({0x09}).bytes()));
  EXPECT_FALSE(reads(BinaryDocument().addDictionary({0, 0}).bytes()));
}

TEST(BinaryReader, ReferencesStayInTheDocument) {
  EXPECT_FALSE(reads(BinaryDocument().addArray({1}).bytes()));
  EXPECT_FALSE(reads(BinaryDocument().add({0x09}).bytes(1)));
  EXPECT_FALSE(isSafeAlone({0xa1, 0}));
  EXPECT_FALSE(reads(BinaryDocument().addText("a").add({0xd1, 0, 0}).bytes(1)));
  EXPECT_FALSE(isSafeAlone({0xaf, 0x13, 0x7f, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff}));
  EXPECT_FALSE(isSafeAlone({0xdf, 0x13, 0x80, 0, 0, 0, 0, 0, 0, 0}));
}

TEST(BinaryReader, RefusesObjectsThatContainThemselves) {
  EXPECT_FALSE(reads(BinaryDocument().addArray({0}).bytes()));
  EXPECT_FALSE(reads(BinaryDocument().addArray({1}).addArray({0}).bytes()));
  EXPECT_FALSE(reads(BinaryDocument().addDictionary({1, 0}).addText("a").bytes()));
}

TEST(BinaryReader, ContainersNestAsDeepAsAllowed) {
  EXPECT_TRUE(reads(nested(128)));
  EXPECT_FALSE(reads(nested(129)));
  EXPECT_FALSE(reads(nested(60'000)));
}

TEST(BinaryReader, CountsSharedObjectsAsOftenAsTheyAreShared) {
  EXPECT_TRUE(reads(nested(18, 2)));   // 2^19 - 1 values
  EXPECT_FALSE(reads(nested(19, 2)));  // 2^20 - 1
  EXPECT_FALSE(reads(nested(100, 2)));
}

TEST(BinaryReader, CountsSharedBytesAsOftenAsTheyAreShared) {
  Bytes megabyte{0x4f, 0x12, 0, 0x10, 0, 0};
  megabyte.resize(megabyte.size() + (std::size_t{1} << 20));
  EXPECT_TRUE(reads(repeated(64, megabyte)));
  EXPECT_FALSE(reads(repeated(65, megabyte)));
}

TEST(BinaryReader, BoundsTheBytesOfAllTextsAndDataToTheByte) {
  Bytes megabyte{0x4f, 0x12, 0, 0x10, 0, 0};
  megabyte.resize(megabyte.size() + (std::size_t{1} << 20));
  Bytes array{0xaf, 0x10, 65};
  for (int place = 0; place < 64; ++place) array.insert(array.end(), {0, 1});
  array.insert(array.end(), {0, 2});
  const auto document = [&](const Bytes& last) {
    return BinaryDocument().add(array).add(megabyte).add(last).bytes();
  };
  EXPECT_TRUE(reads(document({0x40})));
  EXPECT_FALSE(reads(document({0x41, 0})));
}

TEST(BinaryReader, BoundsTheEntriesOfADictionary) {
  const auto document = [](std::size_t entries) {
    return BinaryDocument().add(dictionaryOf(entries, 1)).addText("a").bytes();
  };
  EXPECT_TRUE(reads(document(plistLimits::dictionaryEntries)));
  EXPECT_FALSE(reads(document(plistLimits::dictionaryEntries + 1)));
}

TEST(BinaryReader, CountsKeysToo) {
  const auto document = [](std::size_t entries) {  // fifty times the dictionary
    Bytes array{0xaf, 0x10, 50};
    for (int place = 0; place < 50; ++place) array.insert(array.end(), {0, 1});
    return BinaryDocument().add(array).add(dictionaryOf(entries, 2)).addText("a").bytes();
  };
  EXPECT_TRUE(reads(document(9'999)));  // 1 + 50 * (1 + 2 * 9,999) values
  EXPECT_FALSE(reads(document(10'000)));
}

TEST(BinaryReader, RefusesTrailersThatContradictTheDocument) {
  const Bytes good = BinaryDocument().add({0x09}).bytes();
  ASSERT_TRUE(reads(good));
  const auto changed = [&](std::size_t fromEnd, std::uint8_t value) {
    Bytes document = good;
    document[document.size() - fromEnd] = value;
    return reads(document);
  };
  EXPECT_FALSE(changed(26, 0)) << "size of an offset";
  EXPECT_FALSE(changed(26, 9)) << "size of an offset";
  EXPECT_FALSE(changed(25, 0)) << "size of a reference";
  EXPECT_FALSE(changed(25, 255)) << "size of a reference";
  EXPECT_FALSE(changed(17, 0)) << "number of objects";
  EXPECT_FALSE(changed(17, 2)) << "number of objects";
  EXPECT_FALSE(changed(24, 0x80)) << "number of objects";
  EXPECT_FALSE(changed(9, 1)) << "top object";
  EXPECT_FALSE(changed(1, 0)) << "place of the offsets";
  EXPECT_FALSE(changed(1, 8)) << "place of the offsets";
  EXPECT_FALSE(changed(1, 14)) << "place of the offsets";
  EXPECT_FALSE(changed(8, 0xff)) << "place of the offsets";
  EXPECT_FALSE(changed(33, 7)) << "an offset into the magic";
  EXPECT_FALSE(changed(33, 9)) << "an offset into the offsets";
}

TEST(BinaryReader, RefusesDocumentsCutAnywhere) {
  const Bytes document = BinaryDocument().addDictionary({1, 2}).addText("key").addText("value").bytes();
  ASSERT_TRUE(reads(document));
  for (std::size_t size = 0; size < document.size(); ++size) {
    EXPECT_FALSE(reads(std::span(document).first(size))) << size;
  }
}

TEST(BinaryReader, RefusesOtherVersionsAndSizes) {
  Bytes document = BinaryDocument().add({0x09}).bytes();
  document[7] = '5';
  EXPECT_FALSE(reads(document));
  EXPECT_FALSE(reads(bytesOf("bplist00")));
  Bytes large(plistLimits::documentBytes + 1 - BinaryDocument().bytes().size() - 4);
  large[0] = 0x09;
  EXPECT_FALSE(isSafeAlone(large));
  large.pop_back();
  EXPECT_TRUE(isSafeAlone(large));
}

}  // namespace
}  // namespace kelvasi
