// SPDX-License-Identifier: Apache-2.0
#include "Redaction/IdentitySearch.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::hex;

constexpr std::string_view number = "8999901000000000013";

IdentitySearch searchFor(std::string_view text) {
  RemovedIdentities removed;
  removed.addText(text);
  return IdentitySearch(removed);
}

bool isFound(std::string_view text, const Bytes& bytes) {
  return searchFor(text).look(bytes).has_value();
}

// By so many bits to the right, among ones.
Bytes shifted(const Bytes& bytes, unsigned bits) {
  Bytes result{0xFF};
  unsigned carry = 0xFF;
  for (const std::uint8_t byte : bytes) {
    result.push_back(static_cast<std::uint8_t>((carry << 8 | byte) >> bits));
    carry = byte;
  }
  result.push_back(static_cast<std::uint8_t>((carry << 8 | 0xFF) >> bits));
  return result;
}

// Each byte with its bits the other way round.
Bytes mirrored(Bytes bytes) {
  for (std::uint8_t& byte : bytes) {
    unsigned other = 0;
    for (unsigned bit = 0; bit < 8; ++bit) other |= (byte >> bit & 1u) << (7 - bit);
    byte = static_cast<std::uint8_t>(other);
  }
  return bytes;
}

struct Form {
  const char* name;
  Bytes bytes;
};
std::vector<Form> formsOfNumber() {
  return {
      {"text", Bytes(number.begin(), number.end())},
      {"UTF-16, little-endian", hex("3800 3900 3900 3900 3900 3000 3100 3000 3000 3000 3000 3000 3000 3000"
                                    "3000 3000 3000 3100 3300")},
      {"UTF-16, big-endian", hex("0038 0039 0039 0039 0039 0030 0031 0030 0030 0030 0030 0030 0030 0030"
                                 "0030 0030 0030 0031 0033")},
      {"BCD", hex("8999901000000000013F")},
      {"BCD, swapped", hex("98990901000000001 0F3")}};
}

TEST(IdentitySearch, FindsEachFormAtEveryBit) {
  for (const Form& form : formsOfNumber()) {
    for (unsigned bits = 0; bits < 8; ++bits)
      EXPECT_TRUE(isFound(number, shifted(form.bytes, bits))) << form.name << ", bit " << bits;
  }
}

TEST(IdentitySearch, FindsTextInRecordsThatCountBitsFromTheLowest) {
  const Bytes text(number.begin(), number.end());
  for (unsigned bits = 0; bits < 8; ++bits)
    EXPECT_TRUE(isFound(number, mirrored(shifted(mirrored(text), bits)))) << bits;
}

TEST(IdentitySearch, FindsDigitsWithoutWhatStandsBetweenThem) {
  EXPECT_TRUE(isFound("+49 170/1234567", hex("49 17 01 23 45 67")));
  EXPECT_TRUE(isFound("+49 170/1234567", Bytes{'4', '9', '1', '7', '0', '1', '2', '3', '4', '5', '6', '7'}));
}

TEST(IdentitySearch, FindsTheBytesOfHexadecimalText) {
  EXPECT_TRUE(isFound("12AB99F910FFFE0001", hex("00 12 AB 99 F9 10 FF FE 00 01")));
}

TEST(IdentitySearch, FindsAcrossPieces) {
  IdentitySearch search = searchFor(number);
  EXPECT_FALSE(search.look(Bytes{'x', '8', '9', '9', '9', '9', '0', '1'}));
  EXPECT_FALSE(search.look(Bytes{'0', '0', '0', '0', '0', '0'}));
  EXPECT_EQ(search.look(Bytes{'0', '0', '0', '0', '1', '3'}), 1u);
}

TEST(IdentitySearch, OneDigitMakesAnother) {
  EXPECT_FALSE(isFound(number, hex("8999901000000000023F")));
  Bytes text(number.begin(), number.end());
  text.back() = '4';
  EXPECT_FALSE(isFound(number, text));
}

TEST(IdentitySearch, ShortAndMonotonousOnesAreCounted) {
  RemovedIdentities removed;
  removed.addText("0008");
  removed.addText("0000000000");
  removed.addBytes(hex("FF FF FF FF FF FF"));
  removed.addBytes(hex("12 34 56 78 9A"));
  IdentitySearch search(removed);
  EXPECT_EQ(search.notLookedFor(), 3u);
  EXPECT_FALSE(search.look(hex("30 30 30 38 FF FF FF FF FF FF FF")));
  EXPECT_TRUE(search.look(hex("00 12 34 56 78 9A")));
}

}  // namespace
}  // namespace kelvasi
