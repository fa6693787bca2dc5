// SPDX-License-Identifier: Apache-2.0
#include "Capture/PcapWriter.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>

#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;
using namespace std::chrono_literals;
using testing::FileSizeLimit;
using Existing = OutputFile::Existing;

std::ptrdiff_t namesBeside(const std::string& path) {
  return std::distance(std::filesystem::directory_iterator(std::filesystem::path(path).parent_path()), {});
}

struct PcapWriterTest : ::testing::Test {
  CaptureDirectory directory;
  std::string path = directory.path("a.pcap");
};

TEST_F(PcapWriterTest, WritesTheBytesOfTheFormat) {
  {
    PcapWriter writer(path, Existing::stays);
    EXPECT_TRUE(writer.write(hex("AABBCC"), 1s + 2us + 999ns));
    EXPECT_FALSE(writer.error());
  }
  EXPECT_EQ(readFile(path).bytes, hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000") +
                                      hex("01000000 02000000 03000000 03000000 AABBCC"));
}

TEST_F(PcapWriterTest, IsReadBack) {
  {
    PcapWriter writer(path, Existing::stays);
    writer.write(hex("01"), 1'709'647'629s + 123'456us);
    writer.write({}, 1'709'647'630s);
    writer.write(Bytes(100'000, 0x55), 1'709'647'631s);
  }
  const ReadCapture capture = readCapture(path);
  EXPECT_THAT(capture.messages, ElementsAre(hex("01"), IsEmpty(), Bytes(100'000, 0x55)));
  EXPECT_THAT(capture.arrivals,
              ElementsAre(1'709'647'629'123'456'000, 1'709'647'630'000'000'000, 1'709'647'631'000'000'000));
  EXPECT_FALSE(capture.fault);
}

TEST_F(PcapWriterTest, CutsAMessageThatNoReaderTakes) {
  {
    PcapWriter writer(path, Existing::stays);
    writer.write(Bytes(300'000, 0x55), 1s);
    writer.write(hex("AA"), 2s);
  }
  const ReadCapture capture = readCapture(path);
  EXPECT_THAT(capture.messages, ElementsAre(hex("AA")));
  EXPECT_THAT(
      capture.complaints,
      ElementsAre(path + ": byte 24: message 1 is cut, 262144 of 300000 bytes are there; it is skipped"));
}

TEST_F(PcapWriterTest, LosesNothingWhenTheProcessIsKilled) {
  const pid_t child = ::fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    PcapWriter writer(path, Existing::stays);
    for (std::uint8_t number = 0; number < 100; ++number) writer.write(Bytes{number}, 1s);
    ::raise(SIGKILL);
  }
  int status = 0;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  ASSERT_TRUE(WIFSIGNALED(status));
  EXPECT_EQ(readCapture(path).messages.size(), 100u);
  EXPECT_FALSE(readCapture(path).fault);
}

TEST_F(PcapWriterTest, IsACaptureFromTheStart) {
  const PcapWriter writer(path, Existing::stays);
  EXPECT_THAT(readCapture(path).messages, IsEmpty());
  EXPECT_FALSE(readCapture(path).fault);
}

TEST_F(PcapWriterTest, LeavesAnOlderFileAlone) {
  directory.write("a.pcap", hex("55"));
  const PcapWriter writer(path, Existing::stays);
  EXPECT_EQ(writer.error(), path + ": File exists");
  EXPECT_EQ(readFile(path).bytes, hex("55"));
}

TEST_F(PcapWriterTest, ReplacesAnOlderFileWithTheFirstMessage) {
  directory.write("a.pcap", hex("55"));
  PcapWriter writer(path, Existing::isReplaced);
  EXPECT_TRUE(writer.hasOlder());
  EXPECT_EQ(readFile(path).bytes, hex("55"));
  EXPECT_TRUE(writer.write(hex("AA"), 1s));
  EXPECT_FALSE(writer.hasOlder());
  EXPECT_THAT(readCapture(path).messages, ElementsAre(hex("AA")));
}

TEST_F(PcapWriterTest, LeavesAnOlderFileAloneWithoutAMessage) {
  directory.write("a.pcap", hex("55"));
  EXPECT_TRUE(PcapWriter(path, Existing::isReplaced).close());
  EXPECT_EQ(readFile(path).bytes, hex("55"));
  EXPECT_EQ(namesBeside(path), 1);
}

TEST_F(PcapWriterTest, SaysWhyAFileCannotBeCreated) {
  PcapWriter writer(directory.path("missing/a.pcap"), Existing::stays);
  EXPECT_EQ(writer.error(), directory.path("missing/a.pcap") + ": No such file or directory");
  EXPECT_FALSE(writer.write(hex("AA"), 1s));
}

TEST_F(PcapWriterTest, SaysThatTheDiskIsFull) {
  PcapWriter writer("/dev/full", Existing::stays);
  EXPECT_EQ(writer.error(), "/dev/full: No space left on device");
}

// The messages are longer than a page, and shorter than one, and longer than any buffer of a stream.
const std::vector<Bytes> sent{Bytes(4'200, 0x11), Bytes(40, 0x22), Bytes(5'000, 0x33)};

// How much of what was sent a file of this size holds, whole messages only.
std::size_t wholeIn(std::size_t limit) {
  std::size_t count = 0;
  for (std::size_t size = 24; count < sent.size(); ++count) {
    size += 16 + sent[count].size();
    if (size > limit) break;
  }
  return count;
}

Bytes firstOnes(std::size_t count) {
  Bytes file = hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000");
  for (std::size_t place = 0; place < count; ++place) {
    const auto low = static_cast<std::uint8_t>(sent[place].size() & 0xFF);
    const auto high = static_cast<std::uint8_t>(sent[place].size() >> 8);
    file = file + hex("01000000 00000000") + Bytes{low, high, 0, 0, low, high, 0, 0} + sent[place];
  }
  return file;
}

TEST_F(PcapWriterTest, LeavesWholeMessagesWhateverSizeAFileMayHave) {
  for (std::size_t limit = 24; limit <= firstOnes(sent.size()).size(); ++limit) {
    const std::size_t whole = wholeIn(limit);
    std::size_t taken = 0;
    FileError error;
    {
      const FileSizeLimit sizeLimit(limit);
      PcapWriter writer(path, Existing::stays);
      for (const Bytes& message : sent) taken += writer.write(message, 1s) ? 1u : 0u;
      writer.close();
      error = writer.error();
    }
    ASSERT_EQ(taken, whole) << limit;
    ASSERT_EQ(error, whole == sent.size() ? FileError() : path + ": File too large") << limit;
    ASSERT_EQ(readFile(path).bytes, firstOnes(whole)) << limit;
    std::filesystem::remove(path);
  }
}

TEST_F(PcapWriterTest, LeavesNoFileThatIsTooShortForACapture) {
  for (rlim_t limit = 0; limit < 24; ++limit) {
    const FileSizeLimit sizeLimit(limit);
    EXPECT_EQ(PcapWriter(path, Existing::stays).error(), path + ": File too large");
    EXPECT_FALSE(std::filesystem::exists(path)) << limit;
  }
}

TEST_F(PcapWriterTest, LeavesAnOlderFileAloneWhenTheFirstMessageFindsNoRoom) {
  directory.write("a.pcap", hex("55"));
  {
    const FileSizeLimit sizeLimit(50);
    PcapWriter writer(path, Existing::isReplaced);
    EXPECT_FALSE(writer.write(Bytes(40, 0x11), 1s));
  }
  EXPECT_EQ(readFile(path).bytes, hex("55"));
  EXPECT_EQ(namesBeside(path), 1);
}

}  // namespace
}  // namespace kelvasi
