// SPDX-License-Identifier: MIT
// Writing XML property lists: their layout, that they read back, and which values are refused.
#include "qz/property_list/xml_writer.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

#include "qz/toolkit/exception.hpp"
#include "tests/property_list/random_values.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

std::string xmlRefusalOf(const ValueRef<>& value) {
  try {
    writeXmlPropertyList(value);
  } catch (const InvalidArgumentException& exception) {
    return exception.reason();
  }
  return "";
}

TEST(XmlWriter, WritesWhatOthersWrite) {
  const auto dictionary = Dictionary::make();
  dictionary->setObject(Array::make({String::make("a < b & c > d"), Number::withLong(-5),
                                     Number::withBool(true), Number::withDouble(0.1)}),
                        "10");
  dictionary->setObject(Array::make(), "empty");
  dictionary->setObject(Dictionary::make(), "none");
  dictionary->setObject(Data::make("any carnal pleasure"), "data");
  dictionary->setObject(Date::make(86400), "date");
  EXPECT_EQ(writeXmlPropertyList(dictionary), R"(<?xml version="1.0" encoding="UTF-8"?>
<!DOCTYPE plist PUBLIC "-//Apple//DTD PLIST 1.0//EN" "http://www.apple.com/DTDs/PropertyList-1.0.dtd">
<plist version="1.0">
<dict>
	<key>10</key>
	<array>
		<string>a &lt; b &amp; c &gt; d</string>
		<integer>-5</integer>
		<true/>
		<real>0.1</real>
	</array>
	<key>empty</key>
	<array/>
	<key>none</key>
	<dict/>
	<key>data</key>
	<data>
	YW55IGNhcm5hbCBwbGVhc3VyZQ==
	</data>
	<key>date</key>
	<date>2001-01-02T00:00:00Z</date>
</dict>
</plist>
)");
}

TEST(XmlWriter, WritesWhatReadsBackTheSame) {
  const ValueRef<> values[] = {
      String::make(""),
      String::make(std::string_view("\0\x01\t\n\r\x1F\x7F", 7)),
      String::make("\xEF\xBB\xBF"
                   "marked \xEF\xBF\xBE\xEF\xBF\xBF"),
      String::make("]]> \xC2\x85 \xE2\x80\xA8"),
      Number::withUnsignedLong(UINT64_MAX),
      Number::withLong(INT64_MIN),
      Number::withDouble(-0.0),
      Number::withDouble(4.9e-324),
      Number::withDouble(HUGE_VAL),
      Number::withDouble(-HUGE_VAL),
      Number::withDouble(std::nan("")),
      Date::make(-63145612800),
      Date::make(1e15),
      Data::make(std::string(300, '\xFE')),
      Data::make(""),
      Uid::make(UINT32_MAX),
      Dictionary::make({{String::make("&\n"), Uid::make(0)}}),
      Dictionary::make({{String::make("CF$UID"), Number::withBool(true)}}),
      Dictionary::make({{String::make("CF$UID"), Number::withDouble(1)},
                        {String::make("k"), Number::withBool(true)}}),
  };
  for (const ValueRef<>& value : values) {
    const std::string xml = writeXmlPropertyList(value);
    EXPECT_EQ(dumpOf(xml), canonicalDump(*value)) << xml;
  }
}

TEST(XmlWriter, WritesRandomValuesThatReadBackTheSame) {
  for (std::uint32_t seed = 0; seed < 400; ++seed) {
    const ValueRef<> value = RandomValues(seed, true).value(5);
    ASSERT_EQ(dumpOf(writeXmlPropertyList(value)), canonicalDump(*value)) << "seed " << seed;
  }
}

TEST(XmlWriter, WidensReals) {
  EXPECT_EQ(dumpOf(writeXmlPropertyList(Number::withFloat(0.1F))),
            "{\"real\":\"0.10000000149011612\",\"w\":64}");
}

TEST(XmlWriter, WritesMinusZeroSecondsAsTheSameMoment) {
  EXPECT_EQ(dumpOf(writeXmlPropertyList(Date::make(-0.0))), canonicalDump(*Date::make(0)));
}

TEST(XmlWriter, RefusesWhatXmlCannotCarry) {
  const struct {
    ValueRef<> value;
    std::string_view reason;
  } cases[] = {
      {nullptr, "an absent value (at the root)"},
      {Null::make(), "null (at the root)"},
      {Array::make({Number::withLong(1), Null::make()}), "null (at /1)"},
      {Dictionary::make({{String::make("k"), Array::make({Set::make({})})}}), "a set (at /k/0)"},
      {String::make("\xED\xA0\xBD"), "half a surrogate pair (at the root)"},
      {Dictionary::make({{Number::withLong(1), String::make("v")}}),
       "a key that is not a string (at /1)"},
      {Dictionary::make({{Array::make(), String::make("v")}}),
       "a key that is not a string (at /( ))"},
      {Date::make(0.5),
       "a date with a fraction of a second, or too far away to count its seconds (at the root)"},
      {Date::make(std::nan("")),
       "a date with a fraction of a second, or too far away to count its seconds (at the root)"},
      {Dictionary::make({{String::make("CF$UID"), Number::withLong(1)}}),
       "a dictionary of nothing but a number CF$UID, which reads back as a UID (at the root)"},
      {Array::make({Dictionary::make({{String::make("CF$UID"), Number::withDouble(0.5)}})}),
       "a dictionary of nothing but a number CF$UID, which reads back as a UID (at /0)"},
      {Dictionary::make({{String::make("CF$UID"), Number::withFloat(HUGE_VALF)}}),
       "a dictionary of nothing but a number CF$UID, which reads back as a UID (at the root)"},
  };
  for (const auto& [value, reason] : cases) {
    EXPECT_EQ(xmlRefusalOf(value), "XML property lists cannot hold " + std::string(reason));
  }
}

TEST(XmlWriter, NestsAsDeeplyAsTheReader) {
  ValueRef<> value = Array::make();
  for (int i = 1; i < 512; ++i) value = Array::make({value});
  EXPECT_EQ(dumpOf(writeXmlPropertyList(value)), canonicalDump(*value));
  const std::string tooDeep =
      "XML property lists cannot hold more than 512 nested containers (at " + repeated("/0", 512);
  EXPECT_EQ(xmlRefusalOf(Array::make({value})), tooDeep + ")");
  const auto endless = Array::make();
  endless->addObject(endless);
  EXPECT_EQ(xmlRefusalOf(endless), tooDeep + ")");
  endless->removeAllObjects();
}

}  // namespace
}  // namespace qz::toolkit
