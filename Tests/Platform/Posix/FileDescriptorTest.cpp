// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/FileDescriptor.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

namespace kelvasi {
namespace {

bool isOpen(int number) {
  return ::fcntl(number, F_GETFD) >= 0;
}

FileDescriptor openNull() {
  return FileDescriptor(::open("/dev/null", O_RDONLY));
}

TEST(FileDescriptor, IsClosedAtTheEndOfItsLife) {
  int number = -1;
  {
    const FileDescriptor file = openNull();
    number = file.number();
    EXPECT_TRUE(isOpen(number));
  }
  EXPECT_FALSE(isOpen(number));
}

TEST(FileDescriptor, MovesAndLeavesNoneBehind) {
  FileDescriptor first = openNull();
  const int number = first.number();
  const FileDescriptor second(std::move(first));
  EXPECT_EQ(second.number(), number);
  EXPECT_FALSE(first);  // NOLINT(bugprone-use-after-move): that it is empty is promised
  EXPECT_TRUE(isOpen(number));
}

TEST(FileDescriptor, AnAssignmentClosesTheOlderOne) {
  FileDescriptor one = openNull();
  FileDescriptor other = openNull();
  const int older = one.number();
  const int newer = other.number();
  one = std::move(other);
  EXPECT_EQ(one.number(), newer);
  EXPECT_FALSE(isOpen(older));
  EXPECT_TRUE(isOpen(newer));
}

TEST(FileDescriptor, NoneIsClosedInVain) {
  FileDescriptor none;
  EXPECT_FALSE(none);
  EXPECT_TRUE(none.close());
}

}  // namespace
}  // namespace kelvasi
