// SPDX-License-Identifier: Apache-2.0
// The file system as the application sees it.
#include "Platform/Posix/PosixFiles.h"

#include <gtest/gtest.h>

#include "Platform/Posix/Files.h"
#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

class PosixFilesTest : public ::testing::Test {
 protected:
  const testing::TemporaryDirectory directory;
  const std::string path = directory.file("file");
  PosixFiles files;
};

TEST_F(PosixFilesTest, AFileExistsOnceItIsWritten) {
  EXPECT_FALSE(files.exists(path));
  EXPECT_TRUE(files.write(path, Bytes{1, 2, 3}));
  EXPECT_TRUE(files.exists(path));
  EXPECT_EQ(readFile(path).bytes, (Bytes{1, 2, 3}));
}

TEST_F(PosixFilesTest, ADirectoryExistsToo) {
  EXPECT_TRUE(files.exists(directory.path()));
}

TEST_F(PosixFilesTest, WritingReplacesALongerFile) {
  files.write(path, Bytes{1, 2, 3});
  EXPECT_TRUE(files.write(path, Bytes{9}));
  EXPECT_EQ(readFile(path).bytes, Bytes{9});
}

// Two snapshots that are saved within a second share a name.
TEST_F(PosixFilesTest, AFailureLeavesTheFileThatWasThere) {
  files.write(path, Bytes{1, 2, 3});
  const testing::FileSizeLimit limit(4);
  EXPECT_FALSE(files.write(path, Bytes{4, 5, 6, 7, 8}));
  EXPECT_EQ(readFile(path).bytes, (Bytes{1, 2, 3}));
}

TEST_F(PosixFilesTest, AMissingDirectoryIsAFailureAndIsNotMade) {
  EXPECT_FALSE(files.write(directory.file("none/file"), Bytes{1}));
  EXPECT_FALSE(files.exists(directory.file("none")));
}

TEST_F(PosixFilesTest, AFullDeviceIsAFailureAndStays) {
  EXPECT_FALSE(files.write("/dev/full", Bytes{1}));
  EXPECT_TRUE(files.exists("/dev/full"));
}

}  // namespace
}  // namespace kelvasi
