#include "Capture/CaptureInput.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

const Bytes fileHeader = hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000");

Bytes packet(std::uint8_t byte) {
  return hex("01000000 00000000 01000000 01000000") + Bytes{byte};
}

struct CaptureInputTest : ::testing::Test {
  std::vector<std::uint8_t> read(std::vector<std::string> paths) {
    CaptureInput input(std::move(paths), plists, [this](const std::string& line) { told.push_back(line); });
    std::vector<std::uint8_t> messages;
    while (const auto message = input.next()) messages.push_back(message->bytes.front());
    hasFault = input.hasFault();
    return messages;
  }

  CaptureDirectory directory;
  LibplistSerialiser plists;
  std::vector<std::string> told;
  bool hasFault = false;
};

TEST_F(CaptureInputTest, ReadsOneCaptureAfterTheOther) {
  const std::string first = directory.write("a.pcap", fileHeader + packet(1) + packet(2));
  const std::string empty = directory.write("b.pcap", fileHeader);
  const std::string second = directory.write("c.pcap", fileHeader + packet(3));
  EXPECT_THAT(read({first, empty, second, first}), ElementsAre(1, 2, 3, 1, 2));
  EXPECT_THAT(told, IsEmpty());
  EXPECT_FALSE(hasFault);
}

TEST_F(CaptureInputTest, HasNoMessagesWithoutACapture) {
  EXPECT_THAT(read({}), IsEmpty());
  EXPECT_FALSE(hasFault);
}

TEST_F(CaptureInputTest, TellsOfABadCaptureAndReadsTheOthers) {
  const std::string cut = directory.write("a.pcap", fileHeader + packet(1) + hex("0100"));
  const std::string good = directory.write("b.pcap", fileHeader + packet(2));
  const std::string missing = directory.path("c.pcap");
  EXPECT_THAT(read({missing, cut, good}), ElementsAre(1, 2));
  EXPECT_THAT(told, ElementsAre(missing + ": No such file or directory",
                                ::testing::StartsWith(cut + ": byte 41: truncated dump file")));
  EXPECT_TRUE(hasFault);
}

TEST_F(CaptureInputTest, AMessageThatIsSkippedIsAFault) {
  const Bytes cut = hex("01000000 00000000 01000000 09000000 AA");
  EXPECT_THAT(read({directory.write("a.pcap", fileHeader + cut + packet(2))}), ElementsAre(2));
  EXPECT_EQ(told.size(), 1u);
  EXPECT_TRUE(hasFault);
}

}  // namespace
}  // namespace kelvasi
