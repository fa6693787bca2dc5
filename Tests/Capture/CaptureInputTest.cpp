// SPDX-License-Identifier: Apache-2.0
#include "Capture/CaptureInput.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Telvon/Technology.h"
#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

const Bytes fileHeader = hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000");

// A record of LTE, this byte its payload.
Bytes packet(std::uint8_t byte, const char* code = "7FB1", const char* logType = "01") {
  return hex("01000000 00000000 0E000000 0E000000") + hex(logType) + hex("0D00") + hex(code) +
         hex("0000000000000000") + Bytes{byte};
}

Bytes packets(int count, const char* code) {
  Bytes bytes;
  while (count-- > 0) bytes = bytes + packet(0, code);
  return bytes;
}

constexpr const char* gsm = "3171";
constexpr const char* lte = "7FB1";
constexpr const char* utran = "0AD0";
constexpr const char* unknown = "3412";

struct CaptureInputTest : ::testing::Test {
  std::vector<std::uint8_t> read(std::vector<std::string> paths) {
    CaptureInput input({.paths = std::move(paths), .technology = technology}, plists,
                       [this](const std::string& line) { told.push_back(line); });
    std::vector<std::uint8_t> messages;
    while (const auto message = input.next()) {
      messages.push_back(message->bytes.back());
      if (technologies.empty() || technologies.back() != message->technology)
        technologies.push_back(message->technology);
    }
    hasFault = input.hasFault();
    return messages;
  }

  CaptureDirectory directory;
  LibplistSerialiser plists;
  std::vector<std::string> told;
  bool hasFault = false;
  std::vector<std::string_view> technologies;  // one for each time that it changed
  std::optional<std::string> technology{kTelvonLogChannelTechnology_Orvane_LTE};
};

TEST_F(CaptureInputTest, ReadsOneCaptureAfterTheOther) {
  const std::string first = directory.write("a.pcap", fileHeader + packet(1) + packet(2));
  const std::string empty = directory.write("b.pcap", fileHeader);
  const std::string second = directory.write("c.pcap", fileHeader + packet(3));
  EXPECT_THAT(read({first, empty, second, first}), ElementsAre(1, 2, 3, 1, 2));
  EXPECT_THAT(told, ElementsAre(empty + ": holds no messages"));
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
                                ::testing::StartsWith(cut + ": byte 54: truncated dump file")));
  EXPECT_TRUE(hasFault);
}

TEST_F(CaptureInputTest, AMessageThatIsSkippedIsAFault) {
  const Bytes cut = hex("01000000 00000000 01000000 09000000 AA");
  EXPECT_THAT(read({directory.write("a.pcap", fileHeader + cut + packet(2))}), ElementsAre(2));
  EXPECT_EQ(told.size(), 1u);
  EXPECT_TRUE(hasFault);
}

TEST_F(CaptureInputTest, TellsHowFarItIs) {
  const Bytes bytes = fileHeader + packets(100, lte);
  const std::string path = directory.write("a.pcap", bytes);
  std::vector<std::uint64_t> messageCounts;
  std::uint64_t fileBytes = 0;
  CaptureInput input({.paths = {path, path}, .technology = technology}, plists, {},
                     [&](std::uint64_t messages, std::uint64_t read) {
                       messageCounts.push_back(messages);
                       fileBytes += read;
                     });
  while (input.next()) {
  }
  EXPECT_THAT(messageCounts, ElementsAre(64, 36, 64, 36));
  EXPECT_EQ(fileBytes, 2 * bytes.size());
}

struct CaptureInputFindsTechnology : CaptureInputTest {
  CaptureInputFindsTechnology() { technology.reset(); }

  // What is told of a capture of these packets, behind its name.
  std::vector<std::string> toldOf(const Bytes& packetBytes) {
    told.clear();
    const std::string path = directory.write("a.pcap", fileHeader + packetBytes);
    count = read({path}).size();
    for (std::string& line : told) line.erase(0, path.size());
    return told;
  }

  std::size_t count = 0;
};

TEST_F(CaptureInputFindsTechnology, AndTellsItOfEachCaptureThatHasAnother) {
  const std::string first = directory.write("a.pcap", fileHeader + packet(1));
  const std::string second = directory.write("b.pcap", fileHeader + packet(2, gsm));
  EXPECT_THAT(read({first, first, second, first}), ElementsAre(1, 1, 2, 1));
  EXPECT_THAT(told, ElementsAre(first + ": Orvane_LTE", second + ": Orvane_GSM", first + ": Orvane_LTE"));
  EXPECT_THAT(technologies,
              ElementsAre(kTelvonLogChannelTechnology_Orvane_LTE, kTelvonLogChannelTechnology_Orvane_GSM,
                          kTelvonLogChannelTechnology_Orvane_LTE));
  EXPECT_FALSE(hasFault);
}

TEST_F(CaptureInputFindsTechnology, BehindMessagesThatTellNone) {
  const Bytes silent = packets(500, unknown) + packet(7, "0000", "FF");
  EXPECT_THAT(toldOf(silent + packet(9, utran)), ElementsAre(": Orvane_UTRAN2"));
  EXPECT_EQ(count, 502u);
}

TEST_F(CaptureInputFindsTechnology, InOrderAndWithTheirStamps) {
  CaptureInput input({.paths = {directory.write("a.pcap", fileHeader + packet(1) + packet(2) + packet(3))},
                      .technology = {}},
                     plists, [](const std::string&) {});
  for (const std::uint8_t byte : Bytes{1, 2, 3}) {
    const auto message = input.next();
    ASSERT_TRUE(message);
    EXPECT_EQ(message->bytes.back(), byte);
    EXPECT_EQ(message->arrival, std::chrono::seconds(1));
  }
  EXPECT_FALSE(input.next());
}

TEST_F(CaptureInputFindsTechnology, OfMostMessagesWhereItFitsTwo) {
  EXPECT_THAT(toldOf(packets(2, utran) + packets(3, lte)),
              ElementsAre(": Orvane_LTE",
                          ": fits Orvane_LTE (3 of 5 messages) and Orvane_UTRAN2 (2); taken for Orvane_LTE"));
  EXPECT_FALSE(hasFault);
}

// Later messages are not waited for.
TEST_F(CaptureInputFindsTechnology, AsSoonAsItIsClearAndTellsWhatComesAfterwards) {
  EXPECT_THAT(toldOf(packets(20, gsm) + packets(30, lte)),
              ElementsAre(": Orvane_GSM",
                          ": fits Orvane_LTE (30 of 50 messages) and Orvane_GSM (20); taken for Orvane_GSM"));
}

TEST_F(CaptureInputFindsTechnology, NotWhereItFitsTwoAlike) {
  EXPECT_THAT(
      toldOf(packets(2, utran) + packets(2, lte)),
      ElementsAre(
          ": fits Orvane_LTE (2 of 4 messages) and Orvane_UTRAN2 (2) alike; --technology says which it is"));
  EXPECT_EQ(count, 0u);
  EXPECT_TRUE(hasFault);
}

TEST_F(CaptureInputFindsTechnology, NotWhereItFitsNone) {
  EXPECT_THAT(
      toldOf(packets(4, unknown)),
      ElementsAre(
          ": fits no technology: none asks for any of its messages (4); --technology says which it is"));
  EXPECT_TRUE(hasFault);
  EXPECT_THAT(toldOf(packet(0, "0000", "FF")),
              ElementsAre(": its messages (1) tell no technology; --technology says which it is"));
}

TEST_F(CaptureInputFindsTechnology, NotAmongTheFirstMessagesOfALongCaptureThatTellNone) {
  EXPECT_THAT(
      toldOf(packets(2000, unknown) + packets(50, lte)),
      ElementsAre(
          ": fits no technology: none asks for any of its messages (2000); --technology says which it is"));
}

TEST_F(CaptureInputFindsTechnology, NotWhereThereIsNoMessage) {
  EXPECT_THAT(toldOf({}), ElementsAre(": holds no messages"));
  EXPECT_FALSE(hasFault);
}

TEST_F(CaptureInputFindsTechnology, UnlessItIsGiven) {
  technology = kTelvonLogChannelTechnology_Orvane_GSM;
  EXPECT_THAT(toldOf(packets(3, gsm)), IsEmpty());
  EXPECT_THAT(toldOf(packets(3, gsm) + packets(2, lte)),
              ElementsAre(": fits Orvane_GSM (3 of 5 messages) and Orvane_LTE (2); taken for Orvane_GSM"));
  EXPECT_THAT(toldOf(packets(3, lte)),
              ElementsAre(": fits Orvane_LTE (3 of 3 messages) and Orvane_GSM (0); taken for Orvane_GSM"));
  EXPECT_THAT(toldOf(packets(3, unknown)),
              ElementsAre(": fits no technology: none asks for any of its messages (3)"));
  EXPECT_THAT(technologies, ElementsAre(kTelvonLogChannelTechnology_Orvane_GSM));
  EXPECT_FALSE(hasFault);
}

TEST_F(CaptureInputFindsTechnology, OnceWhereItIsToBeKept) {
  const std::string first = directory.write("a.pcap", fileHeader + packet(1));
  const std::string second = directory.write("b.pcap", fileHeader + packet(2, gsm));
  CaptureInput input({.paths = {first, second}, .technology = {}}, plists,
                     [this](const std::string& line) { told.push_back(line); });
  while (const auto message = input.next()) {
    input.keepTechnology(message->technology);
    EXPECT_EQ(message->technology, kTelvonLogChannelTechnology_Orvane_LTE);
  }
  EXPECT_THAT(
      told,
      ElementsAre(first + ": Orvane_LTE",
                  second + ": fits Orvane_GSM (1 of 1 messages) and Orvane_LTE (0); taken for Orvane_LTE"));
}

}  // namespace
}  // namespace kelvasi
