// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/Files.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <pthread.h>
#include <sys/stat.h>
#include <unistd.h>

#include <csignal>
#include <fstream>
#include <numeric>
#include <thread>

#include "Platform/Posix/FileDescriptor.h"
#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using testing::FileSizeLimit;
using ::testing::IsEmpty;
using testing::TemporaryDirectory;
using testing::Umask;
using ::testing::UnorderedElementsAre;

Bytes manyBytes(std::size_t count) {
  Bytes bytes(count);
  std::iota(bytes.begin(), bytes.end(), std::uint8_t{1});
  return bytes;
}

std::vector<std::string> namesIn(const TemporaryDirectory& directory) {
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(directory.path())) {
    names.push_back(entry.path().filename());
  }
  return names;
}

class FilesTest : public ::testing::Test {
 protected:
  const TemporaryDirectory directory;
  const std::string path = directory.file("file");
};

TEST_F(FilesTest, WhatIsWrittenIsRead) {
  const Bytes bytes = manyBytes(200'000);
  EXPECT_EQ(writeFile(path, bytes), std::nullopt);
  EXPECT_EQ(readFile(path).bytes, bytes);
  EXPECT_EQ(writeFile(path, Bytes{7}), std::nullopt);
  EXPECT_EQ(readFile(path).bytes, Bytes{7});
  EXPECT_EQ(writeFile(path, {}), std::nullopt);
  EXPECT_EQ(readFile(path).bytes, Bytes());
}

TEST_F(FilesTest, ErrorsNameTheFileAndTheReason) {
  EXPECT_EQ(readFile(path).error, path + ": No such file or directory");
  EXPECT_EQ(readFile(directory.path()).error, directory.path().native() + ": Is a directory");
  EXPECT_EQ(writeFile(directory.file("none/file"), {}),
            directory.file("none/file: No such file or directory"));
  EXPECT_EQ(replaceFile(directory.file("none/file"), {}),
            directory.file("none/file: No such file or directory"));
  EXPECT_EQ(writeFile("/dev/full", Bytes{1}), "/dev/full: No space left on device");
}

TEST_F(FilesTest, ReadsUpToTheLimit) {
  writeFile(path, manyBytes(100));
  EXPECT_EQ(readFile(path, 100).bytes.size(), 100u);
  EXPECT_EQ(readFile(path, 99).error, path + ": Larger than 99 bytes");
  EXPECT_EQ(readFile(path, 99).bytes, Bytes());
}

TEST_F(FilesTest, AWriteCutShortIsAnErrorAndLeavesNothing) {
  const FileSizeLimit limit(1000);
  EXPECT_EQ(writeFile(path, manyBytes(2000)), path + ": File too large");
  EXPECT_THAT(namesIn(directory), IsEmpty());
}

TEST_F(FilesTest, AWriteOverAFileThatIsCutShortLeavesTheOldFile) {
  writeFile(path, manyBytes(10));
  const FileSizeLimit limit(1000);
  EXPECT_EQ(writeFile(path, manyBytes(2000)), path + ": File too large");
  EXPECT_EQ(readFile(path).bytes, manyBytes(10));
  EXPECT_THAT(namesIn(directory), ElementsAre("file"));
}

TEST_F(FilesTest, WhatIsNoRegularFileStaysAfterAnError) {
  ASSERT_EQ(::symlink("/dev/full", path.c_str()), 0);
  EXPECT_EQ(writeFile(path, Bytes{1}), path + ": No space left on device");
  EXPECT_THAT(namesIn(directory), ElementsAre("file"));
}

TEST_F(FilesTest, SignalsNeitherCutAWriteShortNorFailIt) {
  struct sigaction quiet {
  }, before{};
  quiet.sa_handler = [](int) {};
  ::sigaction(SIGUSR1, &quiet, &before);  // without SA_RESTART
  ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
  const Bytes bytes = manyBytes(4'000'000);
  FileError error;
  std::thread writer([&] { error = writeFile(path, bytes); });
  std::ifstream pipe(path, std::ios::binary);
  Bytes received;
  for (char block[4096]; pipe.read(block, sizeof block) || pipe.gcount() > 0;) {
    received.insert(received.end(), block, block + pipe.gcount());
    ::pthread_kill(writer.native_handle(), SIGUSR1);
  }
  writer.join();
  ::sigaction(SIGUSR1, &before, nullptr);
  EXPECT_EQ(error, std::nullopt);
  EXPECT_EQ(received.size(), bytes.size());
  EXPECT_TRUE(received == bytes);
}

TEST_F(FilesTest, ReplacesAFileAndLeavesNothingElse) {
  writeFile(path, manyBytes(10));
  EXPECT_EQ(replaceFile(path, Bytes{1, 2}), std::nullopt);
  EXPECT_EQ(readFile(path).bytes, (Bytes{1, 2}));
  EXPECT_THAT(namesIn(directory), ElementsAre("file"));
}

TEST_F(FilesTest, AReplacementThatFailsLeavesTheOldFileAndNothingElse) {
  writeFile(path, manyBytes(10));
  const FileSizeLimit limit(1000);
  EXPECT_EQ(replaceFile(path, manyBytes(2000)), path + ": File too large");
  EXPECT_EQ(readFile(path).bytes, manyBytes(10));
  EXPECT_THAT(namesIn(directory), ElementsAre("file"));
}

TEST_F(FilesTest, FilesAreTheirOwnersAloneWhateverTheUmask) {
  for (const mode_t mask : {0000u, 0022u, 0277u, 0777u}) {
    const Umask umask(mask);
    for (const std::string& name : {directory.file("new"), path, path}) {
      EXPECT_EQ(replaceFile(name, Bytes{1}), std::nullopt);
      EXPECT_EQ(writeFile(name + "-written", Bytes{1}), std::nullopt);
      for (const std::string& file : {name, name + "-written"})
        EXPECT_EQ(std::filesystem::status(file).permissions(), std::filesystem::perms(0600)) << mask;
    }
    for (const std::string& name : namesIn(directory)) std::filesystem::remove(directory.file(name));
  }
}

TEST_F(FilesTest, AReplacementIsItsOwnersAloneWhateverItReplaces) {
  for (const auto replace : {replaceFile, writeFile}) {
    writeFile(path, {});
    std::filesystem::permissions(path, std::filesystem::perms(0644));
    EXPECT_EQ(replace(path, Bytes{1}), std::nullopt);
    EXPECT_EQ(std::filesystem::status(path).permissions(), std::filesystem::perms(0600));
  }
}

TEST_F(FilesTest, AFileLeftOverUnderTheTemporaryNameIsNotTouched) {
  const std::string leftOver = path + "." + std::to_string(::getpid()) + ".0";
  writeFile(leftOver, Bytes{9});
  EXPECT_EQ(replaceFile(path, Bytes{1}), std::nullopt);
  EXPECT_EQ(readFile(leftOver).bytes, Bytes{9});
}

TEST_F(FilesTest, AReplacementFollowsSymbolicLinks) {
  std::filesystem::create_directory(directory.file("other"));
  const std::string target = directory.file("other/target");
  ASSERT_EQ(::symlink("second", path.c_str()), 0);
  ASSERT_EQ(::symlink("other/target", directory.file("second").c_str()), 0);
  EXPECT_EQ(replaceFile(path, Bytes{1}), std::nullopt);  // makes the target
  EXPECT_EQ(readFile(target).bytes, Bytes{1});
  EXPECT_EQ(replaceFile(path, Bytes{2, 3}), std::nullopt);
  EXPECT_EQ(readFile(target).bytes, (Bytes{2, 3}));
  EXPECT_TRUE(std::filesystem::is_symlink(path));
  EXPECT_TRUE(std::filesystem::is_symlink(directory.file("second")));
  EXPECT_THAT(namesIn(directory), UnorderedElementsAre("file", "second", "other"));
}

TEST_F(FilesTest, ALinkToItselfIsAnErrorAndStays) {
  ASSERT_EQ(::symlink("file", path.c_str()), 0);
  EXPECT_EQ(replaceFile(path, Bytes{1}), path + ": Too many levels of symbolic links");
  EXPECT_TRUE(std::filesystem::is_symlink(path));
}

TEST_F(FilesTest, AReplacementIsWrittenIntoAPipe) {
  ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
  const FileDescriptor reader(::open(path.c_str(), O_RDONLY | O_NONBLOCK));
  EXPECT_EQ(replaceFile(path, Bytes{1, 2}), std::nullopt);
  Bytes received(3);
  EXPECT_EQ(::read(reader.number(), received.data(), received.size()), 2);
  EXPECT_THAT(received, ElementsAre(1, 2, 0));
  EXPECT_TRUE(std::filesystem::is_fifo(path));
}

}  // namespace
}  // namespace kelvasi
