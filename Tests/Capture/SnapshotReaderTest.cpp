// SPDX-License-Identifier: Apache-2.0
#include "Capture/SnapshotReader.h"

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

const Bytes mmState = hex("01 0F00 3171 0000000000000000 130802");
const Bytes gmmState = hex("01 0F00 3071 0000000000000000 030901");

// Its DLF file is mmState without its log type, and gmmState.
const std::string snapshot =
    "<plist version=\"1.0\"><dict>"
    "<key>Timestamp</key><string>2024-03-05 14:07:09 +0000</string>"
    "<key>Data</key><array>"
    "<dict><key>DisplayState</key><data>AQ8AMXEAAAAAAAAAABMIAg==</data><key>Description</key>"
    "<string>Snapshot (today)</string></dict>"
    "<dict><key>Description</key><string>DLF binary (31 bytes)</string>"
    "<key>DLF</key><data>DwAxcQAAAAAAAAAAEwgCAQ8AMHEAAAAAAAAAAAMJAQ==</data></dict>"
    "</array><key>Description</key><string></string></dict></plist>";

struct SnapshotReaderTest : ::testing::Test {
  ReadCapture read(const std::string& text) const {
    return readCapture(directory.write("a.kelvasi", bytesOf(text)));
  }
  // The reason, behind the file's name.
  std::string faultOf(const std::string& text) const {
    const ReadCapture capture = read(text);
    EXPECT_THAT(capture.messages, IsEmpty());
    return capture.fault ? capture.fault->text().substr(directory.path("a.kelvasi").size()) : "none";
  }

  CaptureDirectory directory;
};

TEST_F(SnapshotReaderTest, ReadsTheMessagesOfItsDlfFile) {
  const ReadCapture capture = read(snapshot);
  EXPECT_THAT(capture.messages, ElementsAre(mmState, gmmState));
  EXPECT_THAT(capture.arrivals, ElementsAre(0, 0));
  EXPECT_FALSE(capture.fault);
}

TEST_F(SnapshotReaderTest, IsToldByItsContentWhateverItsName) {
  const std::string declaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
  const std::string type = "<!DOCTYPE plist PUBLIC \"-//X//DTD PLIST 1.0//EN\" \"http://x/plist.dtd\">\n";
  for (const std::string& before :
       {std::string(), declaration, declaration + type, type, std::string("\xef\xbb\xbf") + declaration,
        std::string(" \r\n\t"), std::string("\xef\xbb\xbf\n\n"), std::string(200, '\n')}) {
    const ReadCapture capture = readCapture(directory.write("yesterday", bytesOf(before + snapshot)));
    EXPECT_THAT(capture.messages, ElementsAre(mmState, gmmState)) << before;
    EXPECT_FALSE(capture.fault) << before;
  }
}

TEST_F(SnapshotReaderTest, ReadsABinaryPropertyListToo) {
  const LibplistSerialiser plists;
  const auto binary = plists.serialiseBinary(plists.parse(bytesOf(snapshot)).value()).value();
  EXPECT_THAT(readCapture(directory.write("a", binary)).messages, ElementsAre(mmState, gmmState));
}

TEST_F(SnapshotReaderTest, ReadsWhatSaveWrites) {
  TestPlatform surroundings;
  Bytes dlf = beginDlf(surroundings.platform()).value();
  appendDlfInterval(dlf, mmState + gmmState);
  appendDlfInterval(dlf, gmmState);
  const PlistValue saved =
      PlistDictionary::make({{"Data", PlistArray::make({PlistDictionary::make({{"DLF", dlf}})})}});
  const Bytes xml = LibplistSerialiser().serialiseXml(saved).value();
  const ReadCapture capture = readCapture(directory.write("a.kelvasi", xml));
  EXPECT_THAT(capture.messages, ElementsAre(mmState, gmmState, gmmState));
  EXPECT_FALSE(capture.fault);
}

TEST_F(SnapshotReaderTest, HasNoMessagesBeforeAnyArrived) {
  TestPlatform surroundings;
  const PlistValue saved = PlistDictionary::make(
      {{"Data",
        PlistArray::make({PlistDictionary::make({{"DLF", beginDlf(surroundings.platform()).value()}})})}});
  const Bytes xml = LibplistSerialiser().serialiseXml(saved).value();
  const ReadCapture capture = readCapture(directory.write("a.kelvasi", xml));
  EXPECT_THAT(capture.messages, IsEmpty());
  EXPECT_FALSE(capture.fault);
}

TEST_F(SnapshotReaderTest, RefusesWhatIsNoPropertyList) {
  const std::string reason = ": no property list that can be read";
  EXPECT_EQ(faultOf("no property list"), reason);
  EXPECT_EQ(faultOf("<?xml version=\"1.0\"?><svg/>"), reason);
  std::string deep = snapshot;
  const auto place = deep.find("<array>");
  for (int level = 0; level < 128; ++level) {
    deep.insert(place, "<array>");
    deep.insert(deep.rfind("</array>"), "</array>");
  }
  EXPECT_EQ(faultOf(deep), reason);
  EXPECT_EQ(faultOf(""), ": byte 0: an empty file");
}

TEST_F(SnapshotReaderTest, SaysThatAPropertyListEndsTooEarly) {
  const std::string declarations =
      "<?xml version=\"1.0\"?>\n<!DOCTYPE plist PUBLIC \"-//X//DTD PLIST 1.0//EN\" \"http://x/p.dtd\">\n";
  for (const std::string& whole : {snapshot, "\xef\xbb\xbf \n" + declarations + snapshot + "\n"}) {
    const std::size_t end = whole.find("</plist>") + 8;
    for (std::size_t size = 1; size < end; ++size) {
      EXPECT_EQ(faultOf(whole.substr(0, size)),
                ": byte " + std::to_string(size) + ": the property list ends too early");
    }
  }
}

TEST_F(SnapshotReaderTest, SaysThatABinaryPropertyListEndsTooEarly) {
  const LibplistSerialiser plists;
  const Bytes whole = plists.serialiseBinary(plists.parse(bytesOf(snapshot)).value()).value();
  for (std::size_t size = 1; size < whole.size(); ++size) {
    EXPECT_EQ(faultOf(std::string(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size))),
              ": byte " + std::to_string(size) + ": the property list ends too early");
  }
  Bytes damaged = whole;
  damaged[8] = 0xF0;  // no kind of object
  EXPECT_EQ(faultOf(std::string(damaged.begin(), damaged.end())), ": no property list that can be read");
}

TEST_F(SnapshotReaderTest, RefusesAPropertyListThatIsNoSnapshot) {
  const std::string reason = ": no snapshot: there is no \"Data\" array in it";
  EXPECT_EQ(faultOf("<plist><array/></plist>"), reason);
  EXPECT_EQ(faultOf("<plist><dict/></plist>"), reason);
  EXPECT_EQ(faultOf("<plist><dict><key>Data</key><dict/></dict></plist>"), reason);
}

TEST_F(SnapshotReaderTest, RefusesASnapshotWithoutADlfFile) {
  const std::string reason = ": the snapshot holds no DLF and so no messages";
  const auto holding = [](const std::string& entries) {
    return "<plist><dict><key>Data</key><array>" + entries + "</array></dict></plist>";
  };
  EXPECT_EQ(faultOf(holding("")), reason);
  EXPECT_EQ(faultOf(holding("<string>DLF</string>")), reason);
  EXPECT_EQ(faultOf(holding("<dict><key>DisplayState</key><data>AQ8AMXEA</data></dict>")), reason);
  EXPECT_EQ(faultOf(holding("<dict><key>DLF</key><string>DwAx</string></dict>")), reason);
  EXPECT_EQ(faultOf(holding("<dict><key>DLF</key><data></data></dict>")), reason);
  EXPECT_EQ(faultOf("<plist><dict><key>Timestamp</key><string>today</string></dict></plist>"), reason);
}

// The DLF file is mmState without its log type, and a record of 64 bytes of which seven are there.
TEST_F(SnapshotReaderTest, NamesThePlaceInADamagedDlfFileAfterWhatPrecedesIt) {
  const ReadCapture capture = read(
      "<plist><dict><key>Data</key><array><dict><key>DLF</key>"
      "<data>DwAxcQAAAAAAAAAAEwgCAUAAMHEAAA==</data></dict></array></dict></plist>");
  EXPECT_THAT(capture.messages, ElementsAre(mmState));
  ASSERT_TRUE(capture.fault);
  EXPECT_EQ(capture.fault->text(),
            directory.path("a.kelvasi") + ": DLF: byte 15: no whole DLF record begins here");
}

TEST_F(SnapshotReaderTest, RefusesALargerFileThanAPropertyListMayBe) {
  const std::string end = snapshot + std::string(SnapshotReader::largestFile - snapshot.size(), ' ');
  EXPECT_EQ(read(end).messages.size(), 2u);
  EXPECT_EQ(faultOf(end + " "), ": byte 16777216: larger than a snapshot may be here");
}

TEST_F(SnapshotReaderTest, RefusesADirectoryAndAMissingFile) {
  EXPECT_EQ(readCapture(directory.path("b.kelvasi")).fault->reason, "No such file or directory");
  std::filesystem::create_directory(directory.path("directory.kelvasi"));
  EXPECT_EQ(readCapture(directory.path("directory.kelvasi")).fault->reason, "Is a directory");
}

}  // namespace
}  // namespace kelvasi
