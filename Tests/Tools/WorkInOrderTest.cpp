// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/WorkInOrder.h"

#include <gtest/gtest.h>

#include <atomic>
#include <set>
#include <stdexcept>
#include <thread>
#include <vector>

#include "Tools/Kelvasictl/Spool.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;

std::vector<std::size_t> numbersTo(std::size_t count) {
  std::vector<std::size_t> numbers;
  for (std::size_t number = 0; number < count; ++number) numbers.push_back(number);
  return numbers;
}

class WorkInOrder : public testing::TestWithParam<std::size_t> {};

TEST_P(WorkInOrder, ResultsComeInOrderHoweverLongTheWorkTakes) {
  std::vector<std::size_t> results(20);
  std::vector<std::size_t> delivered;
  workInOrder(
      results.size(), GetParam(),
      [&](std::size_t piece) {
        std::this_thread::sleep_for((piece % 3) * 2ms);
        results[piece] = piece;
      },
      [&](std::size_t piece) { delivered.push_back(results[piece]); });
  EXPECT_EQ(delivered, numbersTo(20));
}

TEST_P(WorkInOrder, WhatIsThrownIsThrownOnAfterWhatCameBefore) {
  std::vector<std::size_t> delivered;
  const auto work = [](std::size_t piece) {
    if (piece >= 3) throw std::runtime_error(std::to_string(piece));
  };
  try {
    workInOrder(8, GetParam(), work, [&](std::size_t piece) { delivered.push_back(piece); });
    FAIL();
  } catch (const std::runtime_error& error) {
    EXPECT_STREQ(error.what(), "3");
  }
  EXPECT_EQ(delivered, numbersTo(3));
}

TEST_P(WorkInOrder, AFaultOfTheDeliveryEndsTheWork) {
  std::atomic<std::size_t> begun = 0;
  EXPECT_THROW(workInOrder(
                   1000, GetParam(), [&](std::size_t) { ++begun; },
                   [](std::size_t piece) {
                     if (piece == 2) throw std::runtime_error("full");
                   }),
               std::runtime_error);
  EXPECT_LT(begun, 20U);
}

TEST_P(WorkInOrder, NoWorkIsDoneAtOnce) {
  workInOrder(
      0, GetParam(), [](std::size_t) { FAIL(); }, [](std::size_t) { FAIL(); });
}

INSTANTIATE_TEST_SUITE_P(Workers, WorkInOrder, testing::Values(1, 2, 4));

TEST(WorkInOrder, OneWorkerIsTheCaller) {
  const auto caller = std::this_thread::get_id();
  workInOrder(
      3, 1, [&](std::size_t) { EXPECT_EQ(std::this_thread::get_id(), caller); }, [](std::size_t) {});
}

TEST(WorkInOrder, SeveralWorkersAreSeveral) {
  std::atomic<int> atOnce = 0;
  std::atomic<int> most = 0;
  workInOrder(
      4, 2,
      [&](std::size_t) {
        const int now = ++atOnce;
        for (int seen = most; seen < now && !most.compare_exchange_weak(seen, now);) {
        }
        for (int turn = 0; turn < 500 && most < 2; ++turn) std::this_thread::sleep_for(1ms);
        --atOnce;
      },
      [](std::size_t) {});
  EXPECT_EQ(most, 2);
}

std::string contentsOf(Spool& spool) {
  std::string text;
  spool.giveTo([&](std::string_view piece) { text += piece; });
  return text;
}

TEST(Spool, GivesWhatItGot) {
  Spool spool;
  spool.add("one ");
  spool.add("two");
  EXPECT_EQ(contentsOf(spool), "one two");
  EXPECT_EQ(contentsOf(spool), "");
}

TEST(Spool, GivesMoreThanItKeepsInMemory) {
  Spool spool;
  std::string all;
  for (int line = 0; line < 300000; ++line) {
    const std::string text = std::to_string(line) + "\n";
    spool.add(text);
    all += text;
  }
  EXPECT_EQ(contentsOf(spool), all);
}

}  // namespace
}  // namespace kelvasi
