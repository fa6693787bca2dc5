// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/MonitorView.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

TEST(Redrawing, ClearsBehindEachLineAndBelowTheLast) {
  EXPECT_EQ(redrawing("one\ntwo\n", 24), "\x1b[H\x1b[?7lone\x1b[K\ntwo\x1b[K\n\x1b[?7h\x1b[J");
}

TEST(Redrawing, CutsWhatDoesNotFitAndSaysSo) {
  EXPECT_EQ(redrawing("one\ntwo\nthree\nfour\n", 4),
            "\x1b[H\x1b[?7lone\x1b[K\ntwo\x1b[K\n... and 2 lines more\x1b[K\n\x1b[?7h\x1b[J");
  EXPECT_EQ(redrawing("one\ntwo\nthree\n", 4),
            "\x1b[H\x1b[?7lone\x1b[K\ntwo\x1b[K\nthree\x1b[K\n\x1b[?7h\x1b[J");
}

TEST(Redrawing, NeedsNoRoom) {
  EXPECT_EQ(redrawing("one\ntwo\n", 1), "\x1b[H\x1b[?7l... and 2 lines more\x1b[K\n\x1b[?7h\x1b[J");
  EXPECT_EQ(redrawing("", 24), "\x1b[H\x1b[?7l\x1b[?7h\x1b[J");
}

}  // namespace
}  // namespace kelvasi
