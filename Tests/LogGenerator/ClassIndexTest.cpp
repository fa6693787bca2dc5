// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ClassIndex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <future>

#include "LogGenerator/ArrayLock.h"
#include "LogGenerator/Exceptions.h"
#include "LogGenerator/RowList.h"
#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;

constexpr std::array<LogCode, 2> bothCodes{0xB0C0, 0xFF0001};
constexpr std::array<LogCode, 1> oneCode{0xB0C0};

class First : public Base {
 public:
  using Base::Base;
  std::string_view getSectionName() const override { return "First"; }
  std::span<const LogCode> getLogCodeArray() const override { return bothCodes; }
};

class Second : public Base {
 public:
  using Base::Base;
  std::string_view getSectionName() const override { return "Second"; }
  std::span<const LogCode> getLogCodeArray() const override { return oneCode; }
};

class TwoDecoders : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;
  ~TwoDecoders() override { deallocWith("Deallocing TwoDecoders"); }
  First& first = create<First>();
  Second& second = create<Second>();
};

TEST(ClassIndex, FindsDecodersBySection) {
  test::TestPlatform surroundings;
  const TwoDecoders index(surroundings.platform());
  EXPECT_EQ(index.getClass("First"), &index.first);
  EXPECT_EQ(index.getClass("Second"), &index.second);
  EXPECT_EQ(index.getClass("Third"), nullptr);
}

TEST(ClassIndex, ListsSubscribersInTheOrderOfRegistration) {
  test::TestPlatform surroundings;
  const TwoDecoders index(surroundings.platform());
  EXPECT_THAT(index.getSubscribers(0xB0C0), ElementsAre(&index.first, &index.second));
  EXPECT_THAT(index.getSubscribers(0xFF0001), ElementsAre(&index.first));
  EXPECT_TRUE(index.getSubscribers(1).empty());
}

TEST(ClassIndex, NamesItsLogCodesInDecimal) {
  test::TestPlatform surroundings;
  EXPECT_THAT(TwoDecoders(surroundings.platform()).getAllLogCodes(), ElementsAre("45248", "16711681"));
}

TEST(ClassIndex, LogsTheNumberOfCodesOfEachDecoder) {
  test::TestPlatform surroundings;
  const TwoDecoders index(surroundings.platform());
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("Array Count: 2", "Array Count: 1"));
}

TEST(ClassIndex, StatusSaysWhatTheClassDictionaryIs) {
  test::TestPlatform surroundings;
  const ClassIndex index(surroundings.platform());
  index.status();
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("Dictionary = 1", "String = 0"));
}

// Notes in the trace that it goes.
template <int number>
class Going : public First {
 public:
  using First::First;
  ~Going() override { platform().trace.writeLine("decoder " + std::to_string(number)); }
};

class ThreeDecoders : public ClassIndex {
 public:
  using ClassIndex::ClassIndex;
  ~ThreeDecoders() override { deallocWith("Deallocing ThreeDecoders"); }
  Going<1>& first = create<Going<1>>();
  Going<2>& second = create<Going<2>>();
  Going<3>& third = create<Going<3>>();
};

TEST(ClassIndex, ReleasesItsDecodersInTheOrderOfCreationAfterItsLine) {
  test::TestPlatform surroundings;
  { const ThreeDecoders index(surroundings.platform()); }
  EXPECT_THAT(surroundings.trace.lines, ElementsAre("Deallocing ThreeDecoders", "decoder 1", "decoder 2",
                                                    "decoder 3", "Deallocing ClassIndex"));
}

TEST(ClassIndex, SaysToTheStandardOutputThatItGoes) {
  test::TestPlatform surroundings;
  { const TwoDecoders index(surroundings.platform()); }
  EXPECT_THAT(surroundings.trace.lines, ElementsAre("Deallocing TwoDecoders", "Deallocing ClassIndex"));
}

TEST(Base, ItsAbstractOperationsThrow) {
  test::TestPlatform surroundings;
  Base base(surroundings.platform());
  EXPECT_THROW(base.getSectionName(), UnimplementedMethodError);
  EXPECT_THROW(base.sectionKind(), UnimplementedMethodError);
  EXPECT_THROW(base.getLogCodeArray(), UnimplementedMethodError);
  EXPECT_THROW(base.updateWithData(RecordView({}), 1), UnimplementedMethodError);
}

TEST(Base, LogsItsSectionNameWhenBound) {
  test::TestPlatform surroundings;
  First first(surroundings.platform());
  first.updateSectionRef(PlistDictionary::make());
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("First"));
}

TEST(Base, ReplacesAndClearsAnArrayInPlace) {
  const auto section = PlistArray::make({"old"});
  const PlistValue shown = section;
  Base::replaceArrayWith(*section, PlistArray{"a", "b"});
  EXPECT_EQ(shown, PlistValue(PlistArray::make({"a", "b"})));
  Base::clearElementsInArray(*section);
  EXPECT_EQ(shown, PlistValue(PlistArray::make()));
}

// What another thread does under the array lock.
std::future<std::size_t> sizeSeenUnderTheLock(const PlistArray& array) {
  return std::async(std::launch::async, [&array] {
    const ArrayGuard guard;
    return array.size();
  });
}

bool hasToWait(const std::future<std::size_t>& other) {
  return other.wait_for(std::chrono::milliseconds(100)) == std::future_status::timeout;
}

// An element that calls back while the array that held it alone lets go of it.
PlistValue elementThatTells(std::function<void()> onRelease) {
  return PlistValue::Data(new Bytes, [onRelease](const Bytes* bytes) {
    onRelease();
    delete bytes;  // NOLINT(cppcoreguidelines-owning-memory): as every deleter does
  });
}

TEST(Base, AReaderOfAnArrayThatIsBeingReplacedWaitsAndSeesAllOfTheNewOne) {
  std::future<std::size_t> reader;
  bool waited = false;
  const auto section = PlistArray::make();
  section->append(elementThatTells([&] {
    reader = sizeSeenUnderTheLock(*section);
    waited = hasToWait(reader);
  }));
  Base::replaceArrayWith(*section, PlistArray{"a", "b", "c"});
  EXPECT_TRUE(waited);
  EXPECT_EQ(reader.get(), 3u);
}

TEST(Base, AReaderOfAnArrayThatIsBeingClearedWaitsAndSeesItEmpty) {
  std::future<std::size_t> reader;
  bool waited = false;
  const auto section = PlistArray::make({"first"});
  section->append(elementThatTells([&] {
    reader = sizeSeenUnderTheLock(*section);
    waited = hasToWait(reader);
  }));
  Base::clearElementsInArray(*section);
  EXPECT_TRUE(waited);
  EXPECT_EQ(reader.get(), 0u);
}

constexpr Row rowA{.key = "a", .quantity = quantity::count};
constexpr Row rowB{.key = "b", .quantity = quantity::count};

TEST(RowList, UsesTheDictionariesOfTheLastRoundAgain) {
  RowList list;
  { list.add().write(rowA, 1); }
  const PlistDictionary* const before = list.entries().at(0).dictionary();
  list.startAgain({});
  { list.add().write(rowA, 2); }
  EXPECT_EQ(list.entries().at(0).dictionary(), before);
  EXPECT_EQ(*before->get("a").string(), "2");
}

TEST(RowList, LeavesADictionaryAloneThatSomebodyElseHolds) {
  RowList list;
  { list.add().write(rowA, 1); }
  const PlistValue held = list.entries().at(0);
  list.startAgain({});
  { list.add().write(rowA, 2); }
  EXPECT_EQ(*held.dictionary()->get("a").string(), "1");
}

TEST(RowList, KeepsNoRowOfTheLastRound) {
  RowList list;
  {
    RowWriter row = list.add();
    row.write(rowA, 1);
    row.write(rowB, 2);
  }
  list.startAgain({});
  { list.add().write(rowA, 3); }
  EXPECT_EQ(list.entries().at(0), PlistValue(PlistDictionary::make({{"a", "3"}})));
}

}  // namespace
}  // namespace kelvasi
