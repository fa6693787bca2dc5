// SPDX-License-Identifier: Apache-2.0
#include "Capture/InputBytes.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

// The standard input is the reading end of a pipe that holds these bytes.
class PipedInput {
 public:
  explicit PipedInput(const Bytes& bytes) : before_(::dup(STDIN_FILENO)) {
    int ends[2];
    if (::pipe(ends) != 0 || !writeAll(ends[1], bytes)) throw std::runtime_error("no pipe");
    ::dup2(ends[0], STDIN_FILENO);
    ::close(ends[0]);
    ::close(ends[1]);
  }
  ~PipedInput() {
    ::dup2(before_, STDIN_FILENO);
    ::close(before_);
  }
  PipedInput(const PipedInput&) = delete;
  PipedInput& operator=(const PipedInput&) = delete;

 private:
  int before_;
};

TEST(InputBytes, ShowsTheFirstBytesAndReadsThemAllTheSame) {
  const CaptureDirectory directory;
  InputBytes input(directory.write("a", hex("0102030405")));
  EXPECT_THAT(input.firstBytes(2), ElementsAre(1, 2));
  EXPECT_THAT(input.firstBytes(4), ElementsAre(1, 2, 3, 4));
  EXPECT_THAT(input.firstBytes(1), ElementsAre(1));
  Bytes block(3);
  EXPECT_EQ(input.read(block), 3);
  EXPECT_EQ(block, hex("010203"));
  EXPECT_EQ(input.read(block), 1);
  EXPECT_EQ(input.read(block), 1);
  EXPECT_EQ(block[0], 5);
  EXPECT_EQ(input.read(block), 0);
  EXPECT_EQ(input.position(), 5u);
}

TEST(InputBytes, ShowsLessOfAShortFile) {
  const CaptureDirectory directory;
  EXPECT_THAT(InputBytes(directory.write("a", hex("0102"))).firstBytes(4), ElementsAre(1, 2));
  EXPECT_THAT(InputBytes(directory.write("a", {})).firstBytes(4), IsEmpty());
}

TEST(InputBytes, TellsTheStreamsPlaceInAPipe) {
  const PipedInput piped(Bytes(10000));
  InputBytes input("-");
  const auto stream = input.stream();
  Bytes block(5);
  ASSERT_EQ(std::fread(block.data(), 1, block.size(), stream.get()), 5u);
  EXPECT_EQ(::ftello(stream.get()), 5);
}

TEST(InputBytes, ReadsACaptureFromAPipe) {
  const PipedInput piped(hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000") +
                         hex("01000000 02000000 01000000 01000000 AA") + hex("0100"));
  const ReadCapture capture = readCapture("-");
  EXPECT_THAT(capture.messages, ElementsAre(hex("AA")));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->file, "standard input");
  EXPECT_EQ(capture.fault->offset, 41u);
}

TEST(InputBytes, TellsADlfFileInAPipeByItsVersionReport) {
  Bytes report = hex("A100 FD1F");
  report.resize(161);
  const PipedInput piped(report + hex("0D00 C0B0 0000000000000000 77"));
  EXPECT_THAT(readCapture("-").messages, ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
}

TEST(InputBytes, TellsASnapshotInAPipeByItsContent) {
  const PipedInput piped(
      bytesOf("\n<plist><dict><key>Data</key><array><dict><key>DLF</key>"
              "<data>DQDAsAAAAAAAAAAAdw==</data></dict></array></dict></plist>"));
  EXPECT_THAT(readCapture("-").messages, ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
}

TEST(InputBytes, ShowsNoMoreThanItsFirstBytesAndTakesNoneAway) {
  const CaptureDirectory directory;
  InputBytes input(directory.write("a", Bytes(300, 7)));
  EXPECT_EQ(input.firstBytes(1000).size(), PeekedBytes::mostFirstBytes);
  EXPECT_EQ(input.readToEnd(300, "a test"), Bytes(300, 7));
  EXPECT_FALSE(input.fault());
}

}  // namespace
}  // namespace kelvasi
