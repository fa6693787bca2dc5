// SPDX-License-Identifier: Apache-2.0
#include "Capture/PcapReader.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

// magic, version 2.4, two zeros, snapshot length 262144, link type 147
const Bytes fileHeader = hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000");

// 1 s and 2 us after 1970, 3 of 3 bytes
const Bytes firstPacket = hex("01000000 02000000 03000000 03000000 AABBCC");
// 1709647821 s after 1970, 1 byte
const Bytes secondPacket = hex("CD27E765 00000000 01000000 01000000 DD");

struct PcapReaderTest : ::testing::Test {
  ReadCapture read(const Bytes& bytes) const { return readCapture(directory.write("a.pcap", bytes)); }

  CaptureDirectory directory;
};

TEST_F(PcapReaderTest, DeliversPacketsWithTheirStamps) {
  const ReadCapture capture = read(fileHeader + firstPacket + secondPacket);
  EXPECT_THAT(capture.messages, ElementsAre(hex("AABBCC"), hex("DD")));
  EXPECT_THAT(capture.arrivals, ElementsAre(1'000'002'000, 1'709'647'821'000'000'000));
  EXPECT_FALSE(capture.fault);
}

TEST_F(PcapReaderTest, ReadsNanosecondStamps) {
  Bytes bytes = fileHeader + firstPacket;
  bytes[0] = 0x4D;
  bytes[1] = 0x3C;
  EXPECT_THAT(read(bytes).arrivals, ElementsAre(1'000'000'002));
}

TEST_F(PcapReaderTest, ReadsTheOtherByteOrder) {
  const Bytes bytes = hex("A1B2C3D4 0002 0004 00000000 00000000 00040000 00000093") +
                      hex("00000001 00000002 00000001 00000001 EE");
  EXPECT_THAT(read(bytes).messages, ElementsAre(hex("EE")));
  EXPECT_THAT(read(bytes).arrivals, ElementsAre(1'000'002'000));
}

TEST_F(PcapReaderTest, ReadsPcapng) {
  const Bytes section = hex("0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000");
  const Bytes interface = hex("01000000 14000000 9300 0000 00000400 14000000");
  // interface 0, 0x0000000100000002 us, 3 of 3 bytes and one of padding
  const Bytes packet =
      hex("06000000 24000000 00000000 01000000 02000000 03000000 03000000 AABBCC00 24000000");
  const ReadCapture capture = read(section + interface + packet);
  EXPECT_THAT(capture.messages, ElementsAre(hex("AABBCC")));
  EXPECT_THAT(capture.arrivals, ElementsAre(0x100000002 * 1000));
  EXPECT_FALSE(capture.fault);
}

TEST_F(PcapReaderTest, DeliversAnEmptyPacket) {
  const ReadCapture capture = read(fileHeader + hex("01000000 00000000 00000000 00000000") + firstPacket);
  EXPECT_THAT(capture.messages, ElementsAre(IsEmpty(), hex("AABBCC")));
}

TEST_F(PcapReaderTest, HasNoMessagesAndNoFaultWithoutPackets) {
  const ReadCapture capture = read(fileHeader);
  EXPECT_THAT(capture.messages, IsEmpty());
  EXPECT_FALSE(capture.fault);
}

TEST_F(PcapReaderTest, KeepsAbsurdStampsInReach) {
  const ReadCapture capture = read(fileHeader + hex("FFFFFFFF FFFFFFFF 01000000 01000000 AA"));
  EXPECT_THAT(capture.arrivals, ElementsAre(::testing::AllOf(::testing::Ge(0), ::testing::Lt(1ll << 62))));
}

// One of nine bytes.
const Bytes cutPacket = hex("01000000 00000000 01000000 09000000 AA");

TEST_F(PcapReaderTest, SkipsAndNamesMessagesThatAreNotThereAsAWhole) {
  const ReadCapture capture = read(fileHeader + firstPacket + cutPacket + secondPacket + cutPacket);
  EXPECT_THAT(capture.messages, ElementsAre(hex("AABBCC"), hex("DD")));
  EXPECT_FALSE(capture.fault);
  const std::string file = directory.path("a.pcap");
  EXPECT_THAT(capture.complaints,
              ElementsAre(file + ": byte 43: message 2 is cut, 1 of 9 bytes are there; it is skipped",
                          file + ": byte 77: message 4 is cut, 1 of 9 bytes are there; it is skipped"));
}

TEST_F(PcapReaderTest, CountsCutMessagesBeyondTheFirstFew) {
  Bytes bytes = fileHeader;
  for (int count = 0; count < 9; ++count) bytes = bytes + cutPacket;
  bytes.pop_back();
  const ReadCapture capture = read(bytes);
  EXPECT_THAT(capture.messages, IsEmpty());
  ASSERT_EQ(capture.complaints.size(), 7u);
  EXPECT_EQ(capture.complaints[5],
            directory.path("a.pcap") + ": 3 more messages are skipped for the same reason");
  EXPECT_THAT(capture.complaints[6], ::testing::HasSubstr("a.pcap: byte 160: truncated dump file"));
}

TEST_F(PcapReaderTest, DeliversWhatPrecedesAPacketThatEndsTooEarly) {
  Bytes bytes = fileHeader + secondPacket + firstPacket;
  bytes.pop_back();
  const ReadCapture capture = read(bytes);
  EXPECT_THAT(capture.messages, ElementsAre(hex("DD")));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->text(),
            directory.path("a.pcap") +
                ": byte 41: truncated dump file; tried to read 3 captured bytes, only got 2");
}

TEST_F(PcapReaderTest, NamesThePlaceOfAPacketHeaderThatEndsTooEarly) {
  const ReadCapture capture = read(fileHeader + secondPacket + hex("010000"));
  EXPECT_THAT(capture.messages, ElementsAre(hex("DD")));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->offset, 41u);
}

TEST_F(PcapReaderTest, StopsAtAPacketLargerThanAnyCanBe) {
  const ReadCapture capture = read(fileHeader + secondPacket + hex("01000000 00000000 FFFFFF7F FFFFFF7F AA"));
  EXPECT_THAT(capture.messages, ElementsAre(hex("DD")));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->offset, 41u);
}

TEST_F(PcapReaderTest, RefusesAnotherLinkType) {
  Bytes bytes = fileHeader + firstPacket;
  bytes[20] = 1;
  const ReadCapture capture = read(bytes);
  EXPECT_THAT(capture.messages, IsEmpty());
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->text(),
            directory.path("a.pcap") + ": byte 0: link type 1 (EN10MB) instead of 147 (USER0)");
}

TEST_F(PcapReaderTest, RefusesWhatIsNoCapture) {
  for (const char* text : {"", "ab", "this is a text and no capture at all"}) {
    const ReadCapture capture = read(bytesOf(text));
    EXPECT_THAT(capture.messages, IsEmpty()) << text;
    ASSERT_TRUE(capture.fault) << text;
    EXPECT_EQ(capture.fault->offset, 0u) << text;
    EXPECT_NE(capture.fault->reason, "") << text;
  }
}

TEST_F(PcapReaderTest, RefusesADirectoryAndAMissingFile) {
  const ReadCapture aDirectory = readCapture(directory.path(""));
  ASSERT_TRUE(aDirectory.fault);
  EXPECT_EQ(aDirectory.fault->text(), directory.path("") + ": byte 0: Is a directory");

  const ReadCapture missing = readCapture(directory.path("missing.pcap"));
  ASSERT_TRUE(missing.fault);
  EXPECT_EQ(missing.fault->text(), directory.path("missing.pcap") + ": No such file or directory");
}

}  // namespace
}  // namespace kelvasi
