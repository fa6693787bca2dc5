// SPDX-License-Identifier: Apache-2.0
#include "Survey/Series/SeriesStore.h"

#include <gtest/gtest.h>

#include <random>

#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::survey {
namespace {

using namespace std::chrono_literals;

constexpr SeriesKey rsrp{1, &quantity::rsrp};
constexpr const Quantity* any = &quantity::rsrq;
constexpr auto noon = std::chrono::hours(480000);  // since 1970

struct Expected {
  float minimum, maximum, mean;
  std::uint32_t count;
};

void expectSpread(const Spread& spread, const Expected& expected) {
  EXPECT_FLOAT_EQ(spread.minimum, expected.minimum);
  EXPECT_FLOAT_EQ(spread.maximum, expected.maximum);
  EXPECT_NEAR(spread.mean, expected.mean, 1e-3);
  EXPECT_EQ(spread.count, expected.count);
}

Spread between(const SeriesStore& store, SeriesKey key, std::chrono::nanoseconds from,
               std::chrono::nanoseconds to) {
  std::array<Spread, 1> point;
  store.query(key, from, to, point);
  return point[0];
}

TEST(SeriesStore, ASecondKeepsMinimumMaximumMeanAndCount) {
  SeriesStore store;
  store.add(rsrp, noon, -100);
  store.add(rsrp, noon + 400ms, -90);
  store.add(rsrp, noon + 800ms, -95.5F);
  expectSpread(between(store, rsrp, noon, noon + 1s), {-100, -90, -95.1667F, 3});
}

TEST(SeriesStore, AQueryDividesItsTimeIntoPoints) {
  SeriesStore store;
  for (int second = 0; second < 10; ++second) store.add(rsrp, noon + second * 1s, static_cast<float>(second));
  std::array<Spread, 5> points;
  store.query(rsrp, noon, noon + 10s, points);
  for (std::size_t place = 0; place < points.size(); ++place) {
    const auto first = static_cast<float>(2 * place);
    expectSpread(points[place], {first, first + 1, first + 0.5F, 2});
  }
}

TEST(SeriesStore, APointWithoutAValueSaysSo) {
  SeriesStore store;
  store.add(rsrp, noon, 1);
  store.add(rsrp, noon + 9s, 2);
  std::array<Spread, 10> points;
  store.query(rsrp, noon, noon + 10s, points);
  EXPECT_EQ(points[0].count, 1U);
  for (std::size_t place = 1; place < 9; ++place) EXPECT_EQ(points[place].count, 0U) << place;
  EXPECT_EQ(points[9].count, 1U);
}

TEST(SeriesStore, TheEndOfAQueryIsOutside) {
  SeriesStore store;
  store.add(rsrp, noon + 5s, 1);
  EXPECT_EQ(between(store, rsrp, noon, noon + 5s).count, 0U);
  EXPECT_EQ(between(store, rsrp, noon + 5s, noon + 6s).count, 1U);
  EXPECT_EQ(between(store, rsrp, noon + 6s, noon + 9s).count, 0U);
}

TEST(SeriesStore, AQueryOfNothingIsEmpty) {
  SeriesStore store;
  store.add(rsrp, noon, 1);
  EXPECT_EQ(between(store, SeriesKey{2, &quantity::rsrp}, noon, noon + 1s).count, 0U);
  EXPECT_EQ(between(store, SeriesKey{1, &quantity::rsrq}, noon, noon + 1s).count, 0U);
  EXPECT_EQ(between(store, rsrp, noon + 1s, noon).count, 0U);
  store.query(rsrp, noon, noon + 1s, {});
}

TEST(SeriesStore, SeriesDoNotMix) {
  SeriesStore store;
  for (std::uint32_t cell = 0; cell < 50; ++cell) {
    for (std::size_t quantity = 0; quantity < 3; ++quantity)
      store.add({cell, quantity::all[quantity]}, noon, static_cast<float>(cell * 10 + quantity));
  }
  EXPECT_EQ(store.size(), 150U);
  expectSpread(store.whole({17, quantity::all[2]}), {172, 172, 172, 1});
}

TEST(SeriesStore, ATimeThatStepsBackIsKeptWhereItBelongs) {
  SeriesStore store;
  store.add(rsrp, noon + 100s, 1);
  store.add(rsrp, noon + 102s, 3);
  store.add(rsrp, noon + 101s, 2);  // between the two
  store.add(rsrp, noon + 10s, 0);   // before both
  EXPECT_EQ(between(store, rsrp, noon + 10s, noon + 11s).count, 1U);
  expectSpread(between(store, rsrp, noon + 101s, noon + 102s), {2, 2, 2, 1});
  expectSpread(store.whole(rsrp), {0, 3, 1.5F, 4});
}

TEST(SeriesStore, ADayApartIsTwoBlocksOfOneSeries) {
  SeriesStore store;
  store.add(rsrp, noon, 1);
  store.add(rsrp, noon + 24h, 2);
  EXPECT_EQ(between(store, rsrp, noon + 24h, noon + 24h + 1s).count, 1U);
  EXPECT_EQ(store.whole(rsrp).count, 2U);
}

// A value for each second, far more than the blocks for seconds hold.
TEST(SeriesStore, WhatIsOldIsCoarserAndKeepsMinimumMaximumAndCount) {
  SeriesStore store({.series = 4, .blocks = {10, 10, 100}});
  std::minstd_rand random(1);
  std::vector<float> values;
  for (int second = 0; second < 20000; ++second) {
    values.push_back(static_cast<float>(random() % 1000) / 10);
    store.add(rsrp, noon + second * 1s, values.back());
  }
  const auto [least, most] = std::ranges::minmax(values);
  const Spread all = store.whole(rsrp);
  EXPECT_FLOAT_EQ(all.minimum, least);
  EXPECT_FLOAT_EQ(all.maximum, most);
  EXPECT_EQ(all.count, 20000U);
  EXPECT_EQ(store.droppedValues(), 0U);
  // The newest second for second.
  EXPECT_EQ(between(store, rsrp, noon + 19999s, noon + 20000s).count, 1U);
  // Stretches of 64 s, however old.
  for (int at = 0; at < 19000; at += 64) {
    const auto first = values.begin() + at;
    const auto [low, high] = std::minmax_element(first, first + 64);
    const Spread spread = between(store, rsrp, noon + at * 1s, noon + (at + 64) * 1s);
    ASSERT_EQ(spread.count, 64U) << at;
    ASSERT_FLOAT_EQ(spread.minimum, *low) << at;
    ASSERT_FLOAT_EQ(spread.maximum, *high) << at;
  }
}

TEST(SeriesStore, WhatIsDroppedForItsAgeIsCounted) {
  SeriesStore store({.series = 1, .blocks = {2, 2, 2}});
  for (int second = 0; second < 50000; ++second) store.add(rsrp, noon + second * 1s, 1);
  EXPECT_GT(store.droppedValues(), 0U);
  EXPECT_EQ(store.whole(rsrp).count + store.droppedValues(), 50000U);
  EXPECT_EQ(between(store, rsrp, noon, noon + 64s).count, 0U);
}

TEST(SeriesStore, TheSeriesThatWasLongestWithoutAValueMakesWay) {
  SeriesStore store({.series = 2, .blocks = {10, 10, 10}});
  store.add({1, any}, noon, 1);
  store.add({2, any}, noon, 2);
  store.add({1, any}, noon + 1s, 1);
  store.add({3, any}, noon + 2s, 3);
  EXPECT_EQ(store.size(), 2U);
  EXPECT_EQ(store.whole({1, any}).count, 2U);
  EXPECT_EQ(store.whole({2, any}).count, 0U);
  EXPECT_EQ(store.whole({3, any}).count, 1U);
  EXPECT_EQ(store.droppedSeries(), 1U);
  EXPECT_EQ(store.droppedValues(), 1U);
}

// More series than there is room for, each with more values than it may keep.
TEST(SeriesStore, HoldsItsOwnHoweverMuchComes) {
  SeriesStore store({.series = 8, .blocks = {20, 10, 5}});
  std::minstd_rand random(2);
  std::uint64_t added = 0;
  for (int second = 0; second < 100000; ++second, ++added)
    store.add({static_cast<std::uint32_t>(random() % 11), any}, noon + second * 1s, 1);
  std::uint64_t kept = 0;
  store.visitKeys([&](SeriesKey key) { kept += store.whole(key).count; });
  EXPECT_EQ(kept + store.droppedValues(), added);
}

TEST(SeriesStore, TakesNoMemoryWhileItWorks) {
  SeriesStore store;
  std::array<Spread, 100> points;
  const auto allocations = test::allocationsDuring([&] {
    for (int second = 0; second < 20000; ++second) {
      for (std::uint32_t cell = 0; cell < 100; ++cell)
        store.add({cell, any}, noon + second * 1s, static_cast<float>(second));
    }
    store.query(rsrp, noon, noon + 20000s, points);
  });
  EXPECT_EQ(allocations, 0U);
}

TEST(SeriesStore, ADayFitsInto32Megabytes) {
  EXPECT_LE(SeriesStore().bytes(), 32'000'000U);
}

TEST(SeriesStore, MergedDrivesAreOneSeries) {
  SeriesStore morning;
  SeriesStore evening;
  for (int second = 0; second < 3000; ++second) {
    morning.add(rsrp, noon + second * 1s, -80);
    evening.add({9, &quantity::rsrp}, noon + (second + 1500) * 1s, -100);
    evening.add({4, &quantity::rsrp}, noon + second * 1s, -50);
  }
  morning.merge(evening, [](SeriesKey key) -> std::optional<SeriesKey> {
    if (key.cell == 4) return std::nullopt;
    return SeriesKey{1, key.quantity};
  });
  EXPECT_EQ(morning.size(), 1U);
  expectSpread(morning.whole(rsrp), {-100, -80, -90, 6000});
  expectSpread(between(morning, rsrp, noon + 1500s, noon + 3000s), {-100, -80, -90, 3000});
  expectSpread(between(morning, rsrp, noon + 3000s, noon + 4500s), {-100, -100, -100, 1500});
}

}  // namespace
}  // namespace kelvasi::survey
