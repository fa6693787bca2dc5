// SPDX-License-Identifier: Apache-2.0
#include "Redaction/Replacement.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

#include "Platform/Nettle/HmacSha256.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

std::string replaced(const Replacement& replacement, std::string text) {
  replacement.replaceText({reinterpret_cast<std::uint8_t*>(text.data()), text.size()});
  return text;
}

struct Keyed {
  explicit Keyed(std::string_view key) : hash(Bytes(key.begin(), key.end())) {}
  HmacSha256 hash;
  Replacement replacement{&hash};
};

// RFC 4231, test case 2.
TEST(HmacSha256, IsThatOfTheStandard) {
  const HmacSha256 hash(Bytes{'J', 'e', 'f', 'e'});
  const std::string_view text = "what do ya want for nothing?";
  const auto digest = hash.of(Bytes(text.begin(), text.end()));
  EXPECT_EQ(Bytes(digest.begin(), digest.end()),
            test::hex("5bdcc146bf60754e6a042426089575c75a003f089d2739839dec58b964ec3843"));
}

TEST(Replacement, BlankKeepsLengthAndPunctuation) {
  EXPECT_EQ(replaced(Replacement(), "+49 170/123-X"), "+00 000/000-x");
  EXPECT_EQ(replaced(Replacement(), "Ö.1"), "xx.0");
  EXPECT_EQ(Replacement().number("lac", 4711), 0u);
}

TEST(Replacement, PseudonymKeepsShapeAndFollowsTheKey) {
  const Keyed one("a key of some bytes");
  const Keyed other("another key of bytes");
  const std::string text = replaced(one.replacement, "+49 170 Ab");
  EXPECT_EQ(text.size(), 10u);
  EXPECT_EQ(text[0], '+');
  EXPECT_EQ(text[3], ' ');
  EXPECT_TRUE(text[8] >= 'A' && text[8] <= 'Z' && text[9] >= 'a' && text[9] <= 'z') << text;
  EXPECT_EQ(text, replaced(one.replacement, "+49 170 Ab"));
  EXPECT_NE(text, replaced(other.replacement, "+49 170 Ab"));
}

TEST(Replacement, DigitsAreTheSameWhateverStandsBetweenThem) {
  const Keyed key("a key of some bytes");
  std::string spaced = replaced(key.replacement, "+49 170");
  std::erase(spaced, ' ');
  EXPECT_EQ(spaced, replaced(key.replacement, "+49170"));
}

TEST(Replacement, NoTwoNumbersOfAKindShareAPseudonym) {
  const Keyed key("a key of some bytes");
  std::set<std::uint64_t> seen;
  for (std::uint64_t number = 0; number < 65536; ++number) {
    const std::uint64_t other = key.replacement.number("lac", number);
    EXPECT_EQ(std::to_string(other).size(), std::to_string(number).size()) << number;
    EXPECT_LT(other, 65536u);
    seen.insert(other);
  }
  EXPECT_EQ(seen.size(), 65536u);
  EXPECT_NE(key.replacement.number("lac", 4711), key.replacement.number("tac", 4711));
}

TEST(Replacement, LargestNumberHasOne) {
  const Keyed key("a key of some bytes");
  EXPECT_EQ(std::to_string(key.replacement.number("cell_id", ~std::uint64_t{0})).size(), 20u);
}

}  // namespace
}  // namespace kelvasi
