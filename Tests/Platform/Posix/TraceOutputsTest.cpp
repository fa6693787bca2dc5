// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TraceOutputs.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using testing::WritesTo;

TEST(StandardOutputTrace, LinesAreOutAtOnce) {
  WritesTo standardOutput(STDOUT_FILENO);
  WritesTo standardError(STDERR_FILENO);
  StandardOutputTrace().writeLine("Deallocing");
  EXPECT_THAT(standardOutput.take(), ElementsAre("Deallocing\n"));
  EXPECT_THAT(standardError.take(), IsEmpty());
}

TEST(StandardErrorTrace, LeavesTheStandardOutputAlone) {
  WritesTo standardOutput(STDOUT_FILENO);
  WritesTo standardError(STDERR_FILENO);
  StandardErrorTrace().writeLine("Deallocing");
  EXPECT_THAT(standardOutput.take(), IsEmpty());
  EXPECT_THAT(standardError.take(), ElementsAre("Deallocing\n"));
}

}  // namespace
}  // namespace kelvasi
