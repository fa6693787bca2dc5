// SPDX-License-Identifier: Apache-2.0
#include "Redaction/MessageRedactor.h"

#include <gtest/gtest.h>

#include "Platform/Nettle/HmacSha256.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::record;
using test::textRecord;

constexpr std::array layout{
    Field{.name = "cell", .byte = 14, .bit = 2, .width = 16},
    Field{.name = "area", .byte = 17, .width = 16, .isBigEndian = true},
    Field{.name = "code", .byte = 19},
};
constexpr std::array rows{
    Row{.key = "Cell ID", .quantity = quantity::cellId, .field = indexIn(layout, "cell")},
    Row{.key = "Area", .quantity = quantity::lac, .field = indexIn(layout, "area")},
    Row{.key = "PCI", .quantity = quantity::pci, .field = indexIn(layout, "code")},
};
constexpr std::array simRows{Row{.key = "EF-ICCID", .quantity = quantity::text}};
constexpr LogCode code = 0x4711;

struct Redactor {
  explicit Redactor(RedactionChoice choice = {}, const KeyedHash* hash = nullptr)
      : replacement(hash), messages(catalogs(), plists, replacement, choice) {}

  static std::vector<RowCatalog> catalogs() {
    std::vector<RowCatalog> all(1);
    all[0].add("Serving", {.logCode = code, .layout = layout, .rows = rows});
    all[0].add({.section = "SIM Info",
                .key = "EF-ICCID",
                .logCode = simFilesLogCode,
                .row = simRows.data(),
                .source = "kSimFile_ICCID"});
    return all;
  }
  Bytes of(Bytes message) {
    messages.redact(message);
    return message;
  }
  std::string textOf(std::string_view plist) {
    const Bytes message = of(textRecord(simFilesLogCode, plist));
    return {message.begin() + RecordView::headerSize, message.end()};
  }

  LibplistSerialiser plists;
  Replacement replacement;
  MessageRedactor messages;
};

TEST(MessageRedactor, BlanksTheBitsOfAPlaceAndNoOthers) {
  EXPECT_EQ(Redactor().of(record(code, "FF FF FF FF 12 34 FF FF")), record(code, "FF 03 00 FC 00 00 FF FF"));
}

TEST(MessageRedactor, FieldIsCutWhereTheRecordEnds) {
  EXPECT_EQ(Redactor().of(record(code, "FF FF FF")), record(code, "FF 03 00"));
  EXPECT_EQ(Redactor().of(record(code, "FF")), record(code, "FF"));
}

TEST(MessageRedactor, KeepsCellsWhenAsked) {
  const Bytes message = record(code, "FF FF FF FF 12 34 FF FF");
  EXPECT_EQ(Redactor({.keepsCells = true}).of(message), message);
}

TEST(MessageRedactor, UnknownCodesAreBlankedUnlessKept) {
  EXPECT_EQ(Redactor().of(record(0x4712, "12 34")), record(0x4712, "00 00"));
  EXPECT_EQ(Redactor({.keepsUnknown = true}).of(record(0x4712, "12 34")), record(0x4712, "12 34"));
}

TEST(MessageRedactor, PrefixAndLogTypeAreLookedThrough) {
  Bytes prefixed{0x81, 0x07};
  const Bytes plain = record(code, "FF FF FF FF 12 34 FF FF");
  prefixed.insert(prefixed.end(), plain.begin(), plain.end());
  const Bytes redacted = Redactor().of(prefixed);
  EXPECT_EQ(Bytes(redacted.begin() + 2, redacted.end()), record(code, "FF 03 00 FC 00 00 FF FF"));
  Bytes ofNoType = plain;
  ofNoType[0] = 0x02;
  const Bytes blanked = Redactor().of(ofNoType);
  EXPECT_EQ(Bytes(blanked.begin() + 13, blanked.end()), Bytes(8));
}

TEST(MessageRedactor, ShortMessageIsBlanked) {
  EXPECT_EQ(Redactor().of(Bytes{1, 2, 3}), Bytes(3));
}

constexpr std::string_view sim =
    "<plist version=\"1.0\"><dict><key>kSimFile_ICCID</key><string>89&amp;99</string><!-- 8999 -->"
    "<key>kSimFile_PNN</key><string>Net 1</string><key>Count</key><integer>7</integer>"
    "<key>Phone</key><integer>49170</integer></dict></plist>";

TEST(MessageRedactor, PropertyListIsChangedWhereTheValuesStand) {
  EXPECT_EQ(Redactor().textOf(sim),
            "<plist version=\"1.0\"><dict><key>kSimFile_ICCID</key><string>00xxxx;00</string><!--      -->"
            "<key>kSimFile_PNN</key><string>Net 1</string><key>Count</key><integer>7</integer>"
            "<key>Phone</key><integer>    0</integer></dict></plist>");
}

TEST(MessageRedactor, UnknownNamesThatCouldNameSomebody) {
  constexpr std::string_view list =
      "<plist><dict><key>A</key><string>12345</string><key>B</key><string>short</string>"
      "<key>C</key><data>MTIzNDU=</data></dict></plist>";
  EXPECT_EQ(Redactor().textOf(list),
            "<plist><dict><key>A</key><string>00000</string><key>B</key><string>short</string>"
            "<key>C</key><data>AAAAAAA=</data></dict></plist>");
  EXPECT_EQ(Redactor({.keepsUnknown = true}).textOf(list), list);
}

TEST(MessageRedactor, CDataAndCommentsHideNothing) {
  EXPECT_EQ(Redactor().textOf(
                "<plist><dict><key>IMSI</key><string>12<![CDATA[34]]>5<!--6-->7</string></dict></plist>"),
            "<plist><dict><key>IMSI</key><string>00<![CDATA[00]]>0<!-- -->0</string></dict></plist>");
}

TEST(MessageRedactor, WhatIsNoPropertyListIsBlanked) {
  Redactor redactor;
  EXPECT_EQ(redactor.of(textRecord(simFilesLogCode, "8999901")),
            record(simFilesLogCode, "00 00 00 00 00 00 00"));
  EXPECT_EQ(redactor.messages.counts().unreadable, 1u);
}

class BinaryList : public ::testing::Test {
 protected:
  Bytes redacted(const PlistValue& value, Redactor& redactor) {
    Bytes message = *plists.serialiseBinary(value);
    const std::size_t size = message.size();
    redactor.messages.redact(message);
    EXPECT_EQ(message.size(), size);
    return message;
  }

  LibplistSerialiser plists;
};

TEST_F(BinaryList, TextsNumbersAndDataAreBlanked) {
  Redactor redactor;
  const auto list = PlistDictionary::make({{"IMSI", "999010000000001"},
                                           {"Phone", 4917012345},
                                           {"Address", Bytes{10, 0, 0, 1, 9}},
                                           {"User Name", "Jörg 1"},
                                           {"RSRP", "-101 dBm"}});
  const auto after = plists.parse(redacted(list, redactor));
  ASSERT_TRUE(after);
  EXPECT_EQ(*after, PlistValue(PlistDictionary::make({{"IMSI", "000000000000000"},
                                                      {"Phone", 0},
                                                      {"Address", Bytes(5)},
                                                      {"User Name", "xxxx 0"},
                                                      {"RSRP", "-101 dBm"}})));
  EXPECT_EQ(redactor.messages.counts().identities, 4u);
}

// One object stands for both, so the other value goes with the identity.
TEST_F(BinaryList, SharedObjectsAreReplacedOnce) {
  const HmacSha256 hash(Bytes(16, 7));
  Redactor redactor({}, &hash);
  const auto list = PlistDictionary::make({{"IMSI", "999010000000001"}, {"IMEI", "999010000000001"}});
  const auto after = plists.parse(redacted(list, redactor));
  ASSERT_TRUE(after && after->dictionary());
  EXPECT_EQ(after->dictionary()->get("IMSI"), after->dictionary()->get("IMEI"));
  EXPECT_NE(after->dictionary()->get("IMSI"), list->get("IMSI"));
  EXPECT_EQ(redactor.messages.removed().texts().size(), 1u);
}

TEST_F(BinaryList, BytesThatNothingRefersToAreBlanked) {
  // "A" and then "999" between the objects and their table, which no reference leads to.
  Bytes list = test::hex(
      "62706C6973743030 D1 01 02 51 41 51 42 53 393939 08 0B 0D"
      "000000000000 01 01 0000000000000003 0000000000000000 0000000000000013");
  ASSERT_TRUE(plists.parse(list));
  Redactor redactor;
  redactor.messages.redact(list);
  EXPECT_EQ(Bytes(list.begin() + 8, list.begin() + 19), test::hex("D1 01 02 51 41 51 42 20 20 20 20"));
}

TEST(MessageRedactor, PseudonymsAreTheSameInFieldsAndTexts) {
  const HmacSha256 hash(Bytes(16, 7));
  Redactor redactor({}, &hash);
  const Bytes message = redactor.of(record(code, "00 00 00 00 12 67 00 00"));  // 0x1267 is 4711
  const unsigned other = message[17] * 0x100u + message[18];
  Redactor second({}, &hash);
  EXPECT_EQ(second.replacement.number("lac", 4711), other);
  EXPECT_NE(other, 4711u);
}

}  // namespace
}  // namespace kelvasi
