// SPDX-License-Identifier: Apache-2.0
// What the generators count of the messages that they are given.
#include <gtest/gtest.h>

#include "LogGenerator/LogGenerator.h"
#include "Telvon/Technology.h"
#include "Tests/Support/CellList.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;

// A generator of the technology over a template of these sections.
class Intaking {
 public:
  Intaking(std::string_view technology, const std::string& resource, PlistValue displayTemplate)
      : technology_(technology) {
    surroundings_.log.isMasked = true;
    surroundings_.resources.files[resource] = surroundings_.plists.standFor(std::move(displayTemplate));
    generator_ = LogGenerator::generatorFromTechnology(technology_, surroundings_.platform());
  }

  Outcome outcomeOf(const Bytes& message) {
    const auto before = counts();
    generator_->setArrival(std::chrono::seconds(5));
    generator_->updateState(*state_, message);
    for (std::size_t outcome = 0; outcome < outcomes; ++outcome) {
      if (counts()[outcome] != before[outcome]) return static_cast<Outcome>(outcome);
    }
    throw std::logic_error("the message was not counted");
  }
  Bytes plist(LogCode logCode, PlistValue value) {
    const Bytes token = surroundings_.plists.standFor(std::move(value));
    return test::textRecord(logCode, std::string(token.begin(), token.end()));
  }
  const Intake& intake() const { return generator_->intake(); }
  std::string display() const { return test::asText(state_->get("Display")); }

 private:
  std::array<std::uint64_t, outcomes> counts() const {
    std::array<std::uint64_t, outcomes> counts{};
    for (std::size_t outcome = 0; outcome < outcomes; ++outcome)
      counts[outcome] = generator_->intake().messages(static_cast<Outcome>(outcome));
    return counts;
  }

  std::string technology_;
  test::TestPlatform surroundings_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
};

Intaking lte() {
  return {kTelvonLogChannelTechnology_Orvane_LTE, "LTE.plist",
          PlistDictionary::make({{"Serving Cell Measurements", PlistDictionary::make()},
                                 {"SIM Info", PlistDictionary::make()},
                                 {"PDP Context Info", PlistArray::make()}})};
}

TEST(Outcome, OfARecordIsShownOrTooShort) {
  Intaking intaking = lte();
  EXPECT_EQ(intaking.outcomeOf(record(0xB17F, "05", 33)), Outcome::shown);
  EXPECT_EQ(intaking.outcomeOf(record(0xB17F, "05", 32)), Outcome::tooShort);
  ASSERT_EQ(intaking.intake().counts().size(), 2u);
  const IntakeCount& cut = intaking.intake().counts()[1];
  EXPECT_EQ(cut.logCode, 0xB17Fu);
  EXPECT_EQ(cut.lastLength, 32u);
  EXPECT_EQ(cut.lastVersion, 5);
  EXPECT_EQ(cut.last, std::chrono::seconds(5));
}

TEST(Outcome, OfACodeThatNoDecoderWantsIsNotAskedFor) {
  Intaking intaking = lte();
  EXPECT_EQ(intaking.outcomeOf(record(0x1234, "0102", 15)), Outcome::notAskedFor);
  EXPECT_EQ(intaking.intake().counts()[0].logCode, 0x1234u);
  EXPECT_EQ(intaking.intake().counts()[0].lastVersion, std::nullopt);
  EXPECT_EQ(intaking.intake().counts()[0].sampled, 15);
}

TEST(Outcome, OfARecordWithoutAPlaceInTheTemplateIsThatTheSectionIsMissing) {
  Intaking intaking = lte();
  EXPECT_EQ(intaking.outcomeOf(record(0xB0C2, "", 38)), Outcome::sectionMissing);
  EXPECT_EQ(intaking.outcomeOf(record(0xB180, "", 60)), Outcome::sectionMissing);
}

TEST(Outcome, OfAnotherLogTypeAndOfTooFewBytesIsSaid) {
  Intaking intaking = lte();
  Bytes odd = record(0xB17F, "", 33);
  odd[0] = 7;
  EXPECT_EQ(intaking.outcomeOf(odd), Outcome::unknownLogType);
  EXPECT_EQ(intaking.outcomeOf(Bytes(12, 1)), Outcome::notARecord);
}

TEST(Outcome, OfAPropertyListIsShownOrRefused) {
  Intaking intaking = lte();
  EXPECT_EQ(intaking.outcomeOf(intaking.plist(0xFF0000, PlistDictionary::make())), Outcome::shown);
  EXPECT_EQ(intaking.outcomeOf(intaking.plist(0xFF0000, PlistArray::make())), Outcome::propertyListRefused);
  EXPECT_EQ(intaking.outcomeOf(intaking.plist(0xFF0002, PlistArray::make())), Outcome::shown);
  EXPECT_EQ(intaking.outcomeOf(intaking.plist(0xFF0002, "text")), Outcome::propertyListRefused);
  EXPECT_EQ(intaking.outcomeOf(test::textRecord(0xFF0002, "no list")), Outcome::propertyListRefused);
}

TEST(Outcome, IsNoPartOfTheDisplay) {
  Intaking intaking = lte();
  intaking.outcomeOf(record(0x1234, "", 13));
  const std::string before = intaking.display();
  intaking.outcomeOf(record(0x1234, "", 13));
  intaking.outcomeOf(Bytes(3));
  EXPECT_EQ(intaking.display(), before);
}

// The first decoder of 0x5137 has no section here, a later one shows the record.
TEST(Outcome, IsShownWhereAnyOfSeveralDecodersShowsTheRecord) {
  Intaking intaking(kTelvonLogChannelTechnology_Orvane_GSM, "Orvane_GSM.plist",
                    PlistDictionary::make({{"Neighboring Cells", PlistArray::make()}}));
  EXPECT_EQ(intaking.outcomeOf(record(0x5137, "", 29)), Outcome::shown);
  EXPECT_EQ(intaking.outcomeOf(record(0x5137, "", 28)), Outcome::tooShort);
}

Intaking cdma() {
  return {kTelvonLogChannelTechnology_Orvane_CDMA, "C2KTemplate.plist",
          PlistDictionary::make({{"SID", "kSystemId"}})};
}

TEST(Outcome, OfCdmaRecordsSaysWhyTheyAreNotShown) {
  Intaking intaking = cdma();
  EXPECT_EQ(intaking.outcomeOf(record(0x134F, "02", 171)), Outcome::shown);
  EXPECT_EQ(intaking.outcomeOf(record(0x134F, "02", 170)), Outcome::tooShort);
  EXPECT_EQ(intaking.outcomeOf(record(0x134F, "01", 171)), Outcome::notUnderstood);
  EXPECT_EQ(intaking.intake().counts().back().lastVersion, 1);
  EXPECT_EQ(intaking.outcomeOf(record(0x1183, "", 49)), Outcome::tooShort);
  EXPECT_EQ(intaking.outcomeOf(record(0x1183, "", 51)), Outcome::notUnderstood);
  EXPECT_EQ(intaking.outcomeOf(record(0x119C, "", 17)), Outcome::notUnderstood) << "no sub-packet";
  EXPECT_EQ(intaking.outcomeOf(record(0x1234, "", 17)), Outcome::notAskedFor);
  EXPECT_EQ(intaking.outcomeOf(Bytes(3)), Outcome::notARecord);
}

TEST(Outcome, OfAnObjectIsShown) {
  test::TestPlatform surroundings;
  surroundings.log.isMasked = true;
  const auto generator =
      LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_IFX, surroundings.platform());
  PlistDictionary state;
  generator->updateState(state, surroundings.plists.standFor(PlistDictionary::make({{"State", "On"}})));
  EXPECT_EQ(generator->intake().messages(Outcome::shown), 1u);
}

}  // namespace
}  // namespace kelvasi
