// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PrivateFiles.h"

#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::TemporaryDirectory;
using testing::Umask;

std::filesystem::perms permissionsOf(const std::string& path) {
  return std::filesystem::status(path).permissions();
}

TEST(PrivateFiles, FoldersAreTheirOwnersAloneWhateverTheUmask) {
  const TemporaryDirectory directory;
  std::filesystem::create_directory(directory.file("there"));
  std::filesystem::permissions(directory.file("there"), std::filesystem::perms(0755));
  for (const mode_t mask : {0000u, 0022u, 0377u}) {
    const Umask umask(mask);
    makeFolders(directory.path() / "there" / "new" / "newer");
    EXPECT_EQ(permissionsOf(directory.file("there")), std::filesystem::perms(0755));
    EXPECT_EQ(permissionsOf(directory.file("there/new")), std::filesystem::perms(0700));
    EXPECT_EQ(permissionsOf(directory.file("there/new/newer")), std::filesystem::perms(0700));
    std::filesystem::remove_all(directory.file("there/new"));
  }
}

}  // namespace
}  // namespace kelvasi
