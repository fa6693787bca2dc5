// SPDX-License-Identifier: Apache-2.0
// What holds for every decoder of every class index, and the order that is required of them.
#include <gmock/gmock.h>

#include <algorithm>

#include "LogGenerator/LogGenerator.h"
#include "Tests/LogGenerator/Sections/ClassIndexes.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;

template <typename Decoders, typename Of>
auto each(const Decoders& decoders, Of of) {
  std::vector<decltype(of(*decoders.begin()))> result;
  for (const auto& decoder : decoders) result.push_back(of(decoder));
  return result;
}

std::vector<std::string_view> sectionsOf(const ClassIndex& index) {
  return each(index.decoders(), [](const auto& decoder) { return decoder->getSectionName(); });
}

// Without those that are not in `wanted`.
template <typename Value>
std::vector<Value> onlyThose(std::vector<Value> values, const std::vector<Value>& wanted) {
  std::erase_if(values, [&](const Value& value) { return std::ranges::count(wanted, value) == 0; });
  return values;
}

// Each once, where it first came.
std::vector<LogCode> once(const std::vector<std::vector<LogCode>>& lists) {
  std::vector<LogCode> codes;
  for (const auto& list : lists) {
    for (const LogCode code : list) {
      if (std::ranges::count(codes, code) == 0) codes.push_back(code);
    }
  }
  return codes;
}

std::vector<LogCode> askedBy(const Base& decoder) {
  const auto codes = decoder.getLogCodeArray();
  return {codes.begin(), codes.end()};
}

template <typename Index>
struct EveryClassIndex : testing::Test {
  EveryClassIndex() { created = surroundings.log.warnings(); }

  test::TestPlatform surroundings;
  Index index{surroundings.platform()};
  std::vector<std::string> created;  // the lines of its creation
};
TYPED_TEST_SUITE(EveryClassIndex, test::ClassIndexes, test::IndexName);

TYPED_TEST(EveryClassIndex, HoldsTheRequiredSectionsInTheirOrder) {
  const auto required =
      each(test::Required<TypeParam>::sections, [](const auto& section) { return section.name; });
  EXPECT_EQ(onlyThose(sectionsOf(this->index), required), required);
}

TYPED_TEST(EveryClassIndex, ItsRequiredSectionsAskForTheirCodesInOrder) {
  for (const auto& required : test::Required<TypeParam>::sections) {
    ASSERT_NE(this->index.getClass(required.name), nullptr) << required.name;
    EXPECT_EQ(askedBy(*this->index.getClass(required.name)), required.logCodes) << required.name;
  }
}

TYPED_TEST(EveryClassIndex, CountsTheCodesOfEachDecoderAtItsCreation) {
  EXPECT_THAT(this->created, ElementsAreArray(each(this->index.decoders(), [](const auto& decoder) {
                return "Array Count: " + std::to_string(decoder->getLogCodeArray().size());
              })));
}

TYPED_TEST(EveryClassIndex, FindsEachDecoderByItsSection) {
  for (const auto& decoder : this->index.decoders())
    EXPECT_EQ(this->index.getClass(decoder->getSectionName()), decoder.get()) << decoder->getSectionName();
}

TYPED_TEST(EveryClassIndex, AsksForEveryCodeOnceInTheOrderOfCreation) {
  const auto asked = each(this->index.decoders(), [](const auto& decoder) { return askedBy(*decoder); });
  const auto codes = test::logCodesOf(this->index);
  EXPECT_EQ(codes, once(asked));
  const auto required =
      once(each(test::Required<TypeParam>::sections, [](const auto& section) { return section.logCodes; }));
  EXPECT_EQ(onlyThose(codes, required), required);
}

// The numbers of a list of codes, each counted from `first` on.
std::vector<LogCode> codesIn(const PlistValue& list, LogCode first) {
  std::vector<LogCode> codes;
  for (const PlistValue& element : *list.array())
    codes.push_back(first + static_cast<LogCode>(*element.integer()));
  return codes;
}

TYPED_TEST(EveryClassIndex, TheStartCommandNamesEveryCode) {
  test::TestPlatform own;
  own.resources.files[test::Required<TypeParam>::displayTemplate + std::string(".plist")] = {};
  const auto generator =
      LogGenerator::generatorFromTechnology(test::Required<TypeParam>::technology, own.platform());
  const PlistValue command = generator->getStartCommand();
  std::vector<LogCode> extraCodes = test::logCodesOf(this->index);
  std::erase_if(extraCodes, [](LogCode code) { return code < extraLogCodes; });
  EXPECT_EQ(command.dictionary()->size(), 3u);
  EXPECT_EQ(command.dictionary()->get("SetState"), PlistValue("Streaming"));
  EXPECT_EQ(codesIn(command.dictionary()->get("SetOrvaneLogCodes"), 0), test::recordCodesOf(this->index));
  EXPECT_EQ(codesIn(command.dictionary()->get("SetTelvonExtraCodes"), extraLogCodes), extraCodes);
}

TYPED_TEST(EveryClassIndex, TheSubscribersOfACodeReceiveARecordInTheOrderOfCreation) {
  for (const LogCode code : test::logCodesOf(this->index)) {
    std::vector<Base*> expected;
    for (const auto& decoder : this->index.decoders()) {
      if (std::ranges::count(decoder->getLogCodeArray(), code) != 0) expected.push_back(decoder.get());
    }
    EXPECT_THAT(this->index.getSubscribers(code), ElementsAreArray(expected)) << code;
  }
}

TYPED_TEST(EveryClassIndex, EveryDecoderTracesARecordAndNamesACodeThatItDidNotAskForOrStaysSilent) {
  for (const auto& decoder : this->index.decoders()) {
    this->surroundings.log.clear();
    const Bytes bytes = test::record(0x1234, "01", 100);
    EXPECT_EQ(decoder->updateWithData(RecordView(bytes), 0x1234), Outcome::notAskedFor);
    EXPECT_NE(this->surroundings.log.firstLine(), "") << decoder->getSectionName();
    const auto errors = this->surroundings.log.errors();
    if (!errors.empty()) {
      EXPECT_THAT(errors, ElementsAre("Received an unknown log message: 4660")) << decoder->getSectionName();
    }
  }
}

TYPED_TEST(EveryClassIndex, TheRequiredSectionsTraceTheirNameAndAreSilentOrNot) {
  for (const auto& required : test::Required<TypeParam>::sections) {
    this->surroundings.log.clear();
    const Bytes bytes = test::record(0x1234, "01", 100);
    this->index.getClass(required.name)->updateWithData(RecordView(bytes), 0x1234);
    EXPECT_EQ(this->surroundings.log.firstLine(), required.trace) << required.name;
    EXPECT_EQ(this->surroundings.log.errors().empty(), required.isSilent) << required.name;
    const auto notices = this->surroundings.log.lines(LogPriority::notice);
    EXPECT_EQ(this->surroundings.log.warnings().size() + notices.size(), 1u) << required.name;
  }
}

}  // namespace
}  // namespace kelvasi
