// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/InputFile.h"

#include <gtest/gtest.h>

#include <array>
#include <cerrno>

#include "Platform/Posix/Files.h"
#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::TemporaryDirectory;

TEST(InputFile, IsReadPieceByPieceToItsEnd) {
  const TemporaryDirectory directory;
  ASSERT_EQ(writeFile(directory.file("a"), Bytes{1, 2, 3}), std::nullopt);
  InputFile file(directory.file("a"));
  std::array<std::uint8_t, 2> piece{};
  EXPECT_EQ(file.read(piece), 2);
  EXPECT_EQ(piece, (std::array<std::uint8_t, 2>{1, 2}));
  EXPECT_EQ(file.position(), 2u);
  EXPECT_EQ(file.read(piece), 1);
  EXPECT_EQ(piece[0], 3);
  EXPECT_EQ(file.read(piece), 0);
  EXPECT_EQ(file.position(), 3u);
  EXPECT_FALSE(file.error());
}

TEST(InputFile, OneThatIsNotThereIsAnError) {
  InputFile file("/nowhere/a");
  EXPECT_EQ(file.error(), std::error_code(ENOENT, std::generic_category()));
  EXPECT_EQ(file.name(), "/nowhere/a");
  std::array<std::uint8_t, 2> piece{};
  EXPECT_EQ(file.read(piece), -1);
}

TEST(InputFile, WhatCannotBeReadIsAnErrorWhereItIs) {
  const TemporaryDirectory directory;
  InputFile folder(directory.file("."));
  EXPECT_FALSE(folder.error());
  std::array<std::uint8_t, 2> piece{};
  EXPECT_EQ(folder.read(piece), -1);
  EXPECT_EQ(folder.error(), std::error_code(EISDIR, std::generic_category()));
  EXPECT_EQ(folder.position(), 0u);
}

TEST(InputFile, ADashIsTheStandardInput) {
  const InputFile file("-");
  EXPECT_EQ(file.name(), "standard input");
}

}  // namespace
}  // namespace kelvasi
