// SPDX-License-Identifier: Apache-2.0
// Once the rows of a section exist, a record costs no allocation: for every decoder of every class index.
#include <gtest/gtest.h>

#include <array>

#include "Tests/LogGenerator/Sections/EverySection.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi {
namespace {

template <typename Index>
struct Allocations : testing::Test {};
TYPED_TEST_SUITE(Allocations, test::ClassIndexes, test::IndexName);

// Each of them at each of the code's decoders, without gathering what they say.
template <typename Index>
void takeInTurn(Index& index, LogCode code, const Bytes& first, const Bytes& second, int rounds) {
  for (int round = 0; round < rounds; ++round) {
    for (const Bytes* bytes : {&first, &second}) {
      for (Base* decoder : index.getSubscribers(code)) decoder->updateWithData(RecordView(*bytes), code);
    }
  }
}

struct DeafLog : SystemLog {
  bool wants(LogPriority priority) const override { return priority == LogPriority::error; }
  void write(LogPriority, std::string_view) override {}
};

struct Turn {
  std::uint8_t few, fewer;
};
// As counts of lists: 3 and 2, whether it is the low or the high half of a byte that counts.
constexpr std::array turns{Turn{0x03, 0x02}, Turn{0x33, 0x22}};

// Records with small and with large values: all bytes the same, then FF from some byte on.
TYPED_TEST(Allocations, RecordsInTurnCostNone) {
  DeafLog log;
  test::EverySection<TypeParam> sections(log);
  for (const LogCode code : test::recordCodesOf(sections.index)) {
    sections.bind(code);
    for (const Turn& turn : turns) {
      const Bytes few = test::filled(code, 600, turn.few);
      Bytes fewer = test::filled(code, 600, turn.fewer);
      std::fill(fewer.begin() + 36, fewer.end(), std::uint8_t{0xFF});
      takeInTurn(sections.index, code, few, fewer, 2);
      EXPECT_EQ(test::allocationsDuring([&] { takeInTurn(sections.index, code, few, fewer, 500); }), 0u)
          << std::hex << code;
    }
  }
  EXPECT_NE(sections.shown(), "");
}

}  // namespace
}  // namespace kelvasi
