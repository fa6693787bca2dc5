// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/XmlScalars.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

bool resolves(std::string_view text) {
  std::string whole;
  return appendXmlText(whole, text);
}

TEST(XmlScalars, Integers) {
  for (const char* text : {"0", "-0", "+12", " 7\n", "9223372036854775807", "-9223372036854775808",
                           "18446744073709551615", "0x1F", "-0xff"}) {
    EXPECT_TRUE(xmlInteger(text)) << text;
  }
  for (const char* text : {"", " ", "-", "abc", "12abc", "1.5", "010", "--1", "+ 1", "0x", "0xg",
                           "18446744073709551616", "-9223372036854775809"}) {
    EXPECT_FALSE(xmlInteger(text)) << text;
  }
}

TEST(XmlScalars, Reals) {
  for (const char* text : {"0", "1.5", "-.5", "5.", "1e22", "2.5E-10", "+1e+400", " 1 ", "nan", "+infinity",
                           "-infinity", "inf"}) {
    EXPECT_TRUE(xmlReal(text)) << text;
  }
  for (const char* text : {"", ".", "-", "1,5", "e5", "1e", "1e+", "0x1p3", "1.5.2", "nano", "1 2"}) {
    EXPECT_FALSE(xmlReal(text)) << text;
  }
}

TEST(XmlScalars, Dates) {
  for (const char* text : {"2024-03-05T14:07:09Z", " 2024-02-29T00:00:00Z ", "0001-01-01T23:59:59Z"}) {
    EXPECT_TRUE(xmlDate(text)) << text;
  }
  for (const char* text :
       {"", "2024-03-05", "2024-03-05T14:07:09", "2024-03-05T14:07:09.5Z", "x", "2023-02-29T00:00:00Z",
        "2024-13-01T00:00:00Z", "2024-00-01T00:00:00Z", "2024-01-00T00:00:00Z", "2024-01-01T24:00:00Z",
        "2024-01-01T00:60:00Z", "2024-01-01T00:00:60Z"}) {
    EXPECT_FALSE(xmlDate(text)) << text;
  }
}

TEST(XmlScalars, Data) {
  for (const char* text : {"", " \n\t", "QUJD", "Q U\nJD", "QQ==", "QUI=", "+/+/"}) {
    EXPECT_TRUE(xmlData(text)) << text;
  }
  for (const char* text : {"Q", "QUJ", "Q===", "QQ==QQ==", "=QQQ", "****", "QUJD!", "QU-_"}) {
    EXPECT_FALSE(xmlData(text)) << text;
  }
}

TEST(XmlScalars, ReferencesInStrings) {
  for (const char* text : {"", "plain", "&amp;&lt;&gt;&quot;&apos;", "&#65;", "&#x1F600;", "&#1;", "]]>"}) {
    EXPECT_TRUE(resolves(text)) << text;
  }
  for (const char* text : {"&", "a & b", "&amp", "&foo;", "&;", "&#;", "&#x;", "&#0;", "&#xD800;",
                           "&#x110000;", "&#99999999999;", "&#-1;", "&AMP;"}) {
    EXPECT_FALSE(resolves(text)) << text;
  }
}

}  // namespace
}  // namespace kelvasi
