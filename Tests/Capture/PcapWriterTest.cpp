#include "Capture/PcapWriter.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
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

struct PcapWriterTest : ::testing::Test {
  CaptureDirectory directory;
  std::string path = directory.path("a.pcap");
};

TEST_F(PcapWriterTest, WritesTheBytesOfTheFormat) {
  {
    PcapWriter writer(path);
    EXPECT_TRUE(writer.write(hex("AABBCC"), 1s + 2us + 999ns));
    EXPECT_FALSE(writer.error());
  }
  EXPECT_EQ(readFile(path).bytes, hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000") +
                                      hex("01000000 02000000 03000000 03000000 AABBCC"));
}

TEST_F(PcapWriterTest, IsReadBack) {
  {
    PcapWriter writer(path);
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
    PcapWriter writer(path);
    writer.write(Bytes(300'000, 0x55), 1s);
    writer.write(hex("AA"), 2s);
  }
  const ReadCapture capture = readCapture(path);
  EXPECT_THAT(capture.messages, ElementsAre(Bytes(262'144, 0x55), hex("AA")));
  EXPECT_EQ(capture.cutMessages, 1u);
  EXPECT_FALSE(capture.fault);
}

TEST_F(PcapWriterTest, LosesNothingWhenTheProcessIsKilled) {
  const pid_t child = ::fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    PcapWriter writer(path);
    for (std::uint8_t number = 0; number < 100; ++number) writer.write(Bytes{number}, 1s);
    ::raise(SIGKILL);
  }
  int status = 0;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  ASSERT_TRUE(WIFSIGNALED(status));
  EXPECT_EQ(readCapture(path).messages.size(), 100u);
  EXPECT_FALSE(readCapture(path).fault);
}

TEST_F(PcapWriterTest, OverwritesAnOlderFile) {
  directory.write("a.pcap", Bytes(1000, 0x55));
  PcapWriter writer(path);
  EXPECT_THAT(readCapture(path).messages, IsEmpty());
  EXPECT_FALSE(readCapture(path).fault);
}

TEST_F(PcapWriterTest, SaysWhyAFileCannotBeCreated) {
  PcapWriter writer(directory.path("missing/a.pcap"));
  EXPECT_EQ(writer.error(), directory.path("missing/a.pcap") + ": No such file or directory");
  EXPECT_FALSE(writer.write(hex("AA"), 1s));
}

TEST_F(PcapWriterTest, SaysThatTheDiskIsFull) {
  PcapWriter writer("/dev/full");
  EXPECT_EQ(writer.error(), "/dev/full: No space left on device");
}

TEST_F(PcapWriterTest, LeavesWholeMessagesWhenTheFileMayGrowNoFurther) {
  const auto handler = std::signal(SIGXFSZ, SIG_IGN);
  rlimit before;
  ::getrlimit(RLIMIT_FSIZE, &before);
  const rlimit limit{.rlim_cur = 100, .rlim_max = before.rlim_max};
  ::setrlimit(RLIMIT_FSIZE, &limit);
  {
    PcapWriter writer(path);
    EXPECT_TRUE(writer.write(Bytes(40, 0x11), 1s));
    EXPECT_FALSE(writer.write(Bytes(40, 0x22), 2s));
    EXPECT_EQ(writer.error(), path + ": File too large");
  }
  ::setrlimit(RLIMIT_FSIZE, &before);
  std::signal(SIGXFSZ, handler);
  EXPECT_EQ(std::filesystem::file_size(path), 80u);
  EXPECT_THAT(readCapture(path).messages, ElementsAre(Bytes(40, 0x11)));
  EXPECT_FALSE(readCapture(path).fault);
}

}  // namespace
}  // namespace kelvasi
