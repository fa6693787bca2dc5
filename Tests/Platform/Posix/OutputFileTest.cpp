// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/OutputFile.h"

#include <fcntl.h>
#include <gtest/gtest.h>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::FileSizeLimit;
using testing::TemporaryDirectory;
using testing::Umask;
using Existing = OutputFile::Existing;

struct OutputFileTest : ::testing::Test {
  Bytes read(const std::string& name) const { return readFile(directory.file(name)).bytes; }

  const TemporaryDirectory directory;
  const std::string path = directory.file("file");
};

TEST_F(OutputFileTest, IsItsOwnersAloneWhateverTheUmask) {
  for (const mode_t mask : {0000u, 0777u}) {
    for (const Existing existing : {Existing::stays, Existing::isReplaced, Existing::isReplaced}) {
      const Umask umask(mask);
      OutputFile file(path, existing);
      EXPECT_TRUE(file.append(Bytes{1}) && file.publish() && file.close());
      EXPECT_EQ(std::filesystem::status(path).permissions(), std::filesystem::perms(0600));
      if (existing == Existing::isReplaced) std::filesystem::permissions(path, std::filesystem::perms(0644));
    }
    std::filesystem::remove(path);
  }
}

TEST_F(OutputFileTest, WhatIsNotPublishedIsRemoved) {
  EXPECT_TRUE(OutputFile(path, Existing::stays).append(Bytes{1}));
  EXPECT_FALSE(std::filesystem::exists(path));
}

TEST_F(OutputFileTest, FollowsSymbolicLinks) {
  std::filesystem::create_symlink("target", path);
  for (const std::uint8_t content : Bytes{1, 2}) {
    OutputFile file(path, Existing::isReplaced);
    EXPECT_TRUE(file.append(Bytes{content}) && file.publish());
    EXPECT_EQ(read("target"), Bytes{content});
  }
  EXPECT_TRUE(std::filesystem::is_symlink(path));
  EXPECT_EQ(OutputFile(path, Existing::stays).error(), path + ": File exists");
}

TEST_F(OutputFileTest, APieceThatFindsNoRoomInAPublishedFileIsNotInIt) {
  OutputFile file(path, Existing::stays);
  EXPECT_TRUE(file.append(Bytes{1, 2}) && file.publish());
  {
    const FileSizeLimit limit(4);
    EXPECT_FALSE(file.append(Bytes{3, 4, 5}));
  }
  EXPECT_EQ(file.error(), path + ": File too large");
  EXPECT_FALSE(file.append(Bytes{6}));
  EXPECT_EQ(read("file"), (Bytes{1, 2}));
}

TEST_F(OutputFileTest, APipeIsWrittenInto) {
  ASSERT_EQ(::mkfifo(path.c_str(), 0644), 0);
  const FileDescriptor reader(::open(path.c_str(), O_RDONLY | O_NONBLOCK));
  {
    OutputFile file(path, Existing::stays);
    EXPECT_TRUE(file.append(Bytes{1, 2}) && file.publish() && file.close());
  }
  Bytes received(3);
  EXPECT_EQ(::read(reader.number(), received.data(), received.size()), 2);
  EXPECT_EQ(std::filesystem::status(path).permissions(), std::filesystem::perms(0644));
}

// What a shell's ">>" gives a program as its standard output.
TEST_F(OutputFileTest, TheStandardOutputKeepsWhatWasThereBefore) {
  writeFile(path, Bytes(10, 9));
  const int before = ::dup(STDOUT_FILENO);
  const FileDescriptor appended(::open(path.c_str(), O_WRONLY | O_APPEND));
  ::dup2(appended.number(), STDOUT_FILENO);
  {
    OutputFile file("-", Existing::stays);
    EXPECT_TRUE(file.append(Bytes{1}) && file.publish());
    const FileSizeLimit limit(13);
    EXPECT_FALSE(file.append(Bytes{2, 3, 4}));
    EXPECT_EQ(file.error(), "standard output: File too large");
  }
  ::dup2(before, STDOUT_FILENO);
  ::close(before);
  EXPECT_EQ(read("file"), (Bytes{9, 9, 9, 9, 9, 9, 9, 9, 9, 9, 1}));
}

}  // namespace
}  // namespace kelvasi
