// SPDX-License-Identifier: Apache-2.0
#include "Capture/DlfReader.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Dlf/DlfFile.h"
#include "Tests/Capture/CaptureFiles.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

constexpr std::int64_t second = 1'000'000'000;

struct DlfReaderTest : ::testing::Test {
  ReadCapture read(const Bytes& bytes) const { return readCapture(directory.write("a.dlf", bytes)); }

  CaptureDirectory directory;
};

const Bytes mmState = hex("01 0F00 3171 0000000000000000 130802");
const Bytes gmmState = hex("01 0F00 3071 0000000000000000 030901");
const Bytes cellList = hex("FF 1200 0100 0000000000000000") + bytesOf("bplist");

TEST_F(DlfReaderTest, ReadsASnapshotsFileAsTheMessagesThatWentIn) {
  TestPlatform surroundings;
  Bytes dlf = beginDlf(surroundings.platform()).value();
  appendDlfInterval(dlf, mmState + cellList + gmmState);
  appendDlfInterval(dlf, {});
  appendDlfInterval(dlf, cellList + mmState);
  appendDlfInterval(dlf, hex("8107") + gmmState + hex("8107") + mmState);
  const ReadCapture capture = read(dlf);
  EXPECT_THAT(capture.messages,
              ElementsAre(mmState, cellList, gmmState, cellList, mmState, gmmState, hex("8107") + mmState));
  EXPECT_FALSE(capture.fault);
}

TEST_F(DlfReaderTest, ReadsAPlainFileWithAndWithoutAVersionReport) {
  Bytes report = hex("A100 FD1F");
  report.resize(161);
  const Bytes records = hex("0F00 3171 0000000000000000 130802") + hex("0F00 3071 0000000000000000 030901");
  EXPECT_THAT(read(report + records).messages, ElementsAre(mmState, gmmState));
  EXPECT_THAT(read(records).messages, ElementsAre(mmState, gmmState));
}

TEST_F(DlfReaderTest, HasNoMessagesInAVersionReport) {
  TestPlatform surroundings;
  const ReadCapture capture = read(beginDlf(surroundings.platform()).value());
  EXPECT_THAT(capture.messages, IsEmpty());
  EXPECT_FALSE(capture.fault);
}

// 800 units of 1.25 ms are a second; 6 January 1980 is 315964800 s after 1970.
TEST_F(DlfReaderTest, TakesStampsForSystemTime) {
  const ReadCapture capture = read(hex("0C00 3171 0000 200300000000") + hex("0C00 3171 0080 200300000000"));
  EXPECT_THAT(capture.arrivals, ElementsAre(315'964'801 * second, 315'964'801 * second + 625'000));
}

TEST_F(DlfReaderTest, CarriesTimeOverRecordsWithoutAStamp) {
  const Bytes without = hex("0C00 3171 0000000000000000");
  const Bytes with = hex("0C00 3171 0000 200300000000");
  const Bytes later = hex("0C00 3171 0000 400600000000");
  EXPECT_THAT(read(without + with + without + later + without).arrivals,
              ElementsAre(315'964'801 * second, 315'964'801 * second, 315'964'801 * second,
                          315'964'802 * second, 315'964'802 * second));
  EXPECT_THAT(read(without + without).arrivals, ElementsAre(0, 0));
}

TEST_F(DlfReaderTest, KeepsAbsurdStampsInReach) {
  const ReadCapture capture = read(hex("0C00 3171 FFFFFFFFFFFFFFFF"));
  EXPECT_THAT(capture.arrivals, ElementsAre(::testing::Gt(0)));
}

TEST_F(DlfReaderTest, DeliversWhatPrecedesARecordThatEndsTooEarly) {
  const ReadCapture capture = read(hex("0C00 3171 0000000000000000") + hex("4000 3171 0000000000000000 13"));
  EXPECT_EQ(capture.messages.size(), 1u);
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->text(), directory.path("a.dlf") + ": byte 12: no whole DLF record begins here");
}

TEST_F(DlfReaderTest, RefusesAnEmptyFileAndOneThatIsNoDlfFile) {
  for (const char* text : {"", "no records in here"}) {
    const ReadCapture capture = read(bytesOf(text));
    EXPECT_THAT(capture.messages, IsEmpty()) << text;
    ASSERT_TRUE(capture.fault) << text;
    EXPECT_EQ(capture.fault->offset, 0u) << text;
  }
}

TEST_F(DlfReaderTest, RefusesADirectoryAndAMissingFile) {
  EXPECT_TRUE(readCapture(directory.path("missing.dlf")).fault);
  std::filesystem::create_directory(directory.path("directory.dlf"));
  const ReadCapture capture = readCapture(directory.path("directory.dlf"));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->reason, "Is a directory");
}

}  // namespace
}  // namespace kelvasi
