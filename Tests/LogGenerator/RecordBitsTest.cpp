// SPDX-License-Identifier: Apache-2.0
// The bit reader against a slow one that picks bit after bit.
#include <gtest/gtest.h>

#include <array>
#include <random>
#include <vector>

#include "LogGenerator/RecordLayout.h"
#include "Plist/PlistValue.h"

namespace kelvasi {
namespace {

// The bits of a record one by one, the least significant bit of its first byte first.
std::vector<bool> bitsOf(const Bytes& bytes) {
  std::vector<bool> bits;
  for (std::uint8_t byte : bytes) {
    for (int place = 0; place < 8; ++place) {
      bits.push_back(byte % 2 == 1);
      byte /= 2;
    }
  }
  return bits;
}

std::uint64_t slowly(const std::vector<bool>& bits, std::size_t first, unsigned width) {
  std::uint64_t value = 0;
  for (std::size_t at = first + width; at-- > first;) value = 2 * value + (at < bits.size() && bits[at]);
  return value;
}

std::int64_t slowlySigned(const std::vector<bool>& bits, std::size_t first, unsigned width) {
  const auto value = static_cast<std::int64_t>(slowly(bits, first, width));
  const bool isNegative = first + width - 1 < bits.size() && bits[first + width - 1];
  for (std::int64_t modulus = 2; isNegative; modulus *= 2) {
    if (modulus > value) return value - modulus;
  }
  return value;
}

// Calls `check(record, bits, byte, bit, width)` for every place in several records and past their ends.
template <typename Check>
void everywhere(Check check) {
  std::mt19937 random(20240305);
  for (std::size_t size = 0; size <= 24; ++size) {
    Bytes bytes(size);
    for (std::uint8_t& byte : bytes) byte = static_cast<std::uint8_t>(random());
    const std::vector<bool> bits = bitsOf(bytes);
    for (std::size_t byte = 0; byte <= size + 9; ++byte) {
      for (unsigned bit = 0; bit < 8; ++bit) {
        for (unsigned width = 1; width <= 32; ++width) check(RecordView(bytes), bits, byte, bit, width);
      }
    }
  }
}

TEST(RecordBits, AgreeWithTheSlowReaderAtEveryPlace) {
  std::size_t wrong = 0;
  everywhere(
      [&](RecordView record, const std::vector<bool>& bits, std::size_t byte, unsigned bit, unsigned width) {
        wrong += record.bits(byte, bit, width) != slowly(bits, 8 * byte + bit, width);
      });
  EXPECT_EQ(wrong, 0u);
}

TEST(RecordBits, SignedFieldsAgreeWithTheSlowReaderAtEveryPlace) {
  std::size_t wrong = 0;
  everywhere(
      [&](RecordView record, const std::vector<bool>& bits, std::size_t byte, unsigned bit, unsigned width) {
        const Field field{.name = "any", .byte = byte, .bit = bit, .width = width, .isSigned = true};
        wrong += valueOf(record, field) != slowlySigned(bits, 8 * byte + bit, width);
      });
  EXPECT_EQ(wrong, 0u);
}

TEST(RecordBits, AreZeroFarPastTheEnd) {
  const Bytes bytes(40, 0xFF);
  for (const std::size_t byte : {std::size_t{40}, std::size_t{1} << 40, ~std::size_t{0} - 8})
    EXPECT_EQ(RecordView(bytes).bits(byte, 7, 32), 0u) << byte;
}

}  // namespace
}  // namespace kelvasi
