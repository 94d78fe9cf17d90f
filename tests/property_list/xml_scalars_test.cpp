// SPDX-License-Identifier: MIT
// Integers, reals, dates and data in XML property lists.
#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

struct ScalarCase {
  std::string_view text;
  std::string_view value;
};

/// Reads `text` within the tag, and expects the dump `start` + value + `end`.
template <std::size_t count>
void expect(const ScalarCase (&cases)[count], const std::string& tag, const std::string& start,
            const std::string& end) {
  for (const auto& [text, value] : cases) {
    const std::string xml = "<" + tag + ">" + std::string(text) + "</" + tag + ">";
    const std::string dump =
        value == refused ? std::string(refused) : start + std::string(value) + end;
    EXPECT_EQ(dumpOf(plist(xml)), dump) << text;
  }
}

TEST(XmlScalars, Integers) {
  const ScalarCase cases[] = {
      {"0", "0"},
      {"-0", "0"},
      {"007", "7"},
      {" \n\t+ 5", "5"},
      {"-\n5", "-5"},
      {"\f\v\x01\x7F"
       "5",
       "5"},
      {"\xC2\xA0"
       "5",
       refused},
      {"\xE2\x80\x83"
       "5",
       refused},
      {"-\xE3\x80\x80"
       "5",
       refused},
      {"\xEF\xBB\xBF"
       "5",
       refused},
      {"5 ", refused},
      {"", refused},
      {" ", refused},
      {"+", refused},
      {"++1", refused},
      {"- -1", refused},
      {"1 2", refused},
      {"0x", refused},
      {"0x ", refused},
      {"0XaB", "171"},
      {"-0x0F", "-15"},
      {"00x1", refused},
      {"0x0x1", refused},
      {"0 x1", refused},
      {"a", refused},
      {"1.", refused},
      {"&#49;", refused},
      {"<![CDATA[1]]>", refused},
      {"1<!-- c -->", refused},
      {"9223372036854775807", "9223372036854775807"},
      {"9223372036854775808", "9223372036854775808"},
      {"18446744073709551615", "18446744073709551615"},
      {"18446744073709551616", refused},
      {"99999999999999999999999", refused},
      {"-9223372036854775808", "-9223372036854775808"},
      {"-9223372036854775809", refused},
      {"0x10000000000000000", refused},
      {"-0x8000000000000001", refused},
      {"0x00000000000000000000000000000001", "1"},
  };
  expect(cases, "integer", "{\"int\":\"", "\"}");
}

TEST(XmlScalars, Reals) {
  const ScalarCase cases[] = {
      {".5", "0.5"},
      {"5.", "5"},
      {"+1.5", "1.5"},
      {" \n1.5", "1.5"},
      {"\xE2\x80\x83"
       "1.5",
       "1.5"},
      {"1.5 ", refused},
      {"1.5\n", refused},
      {"", refused},
      {" ", refused},
      {".", refused},
      {"-.", refused},
      {"e5", refused},
      {"1e", refused},
      {"1e+", refused},
      {"1E-2", "0.01"},
      {"1.5.5", refused},
      {"1.5f", refused},
      {"0x1p3", refused},
      {"nAn", "nan"},
      {"-nan", refused},
      {"+nan", refused},
      {"nan0", refused},
      {" nan", refused},
      {"-inf", "-inf"},
      {"+INF", "inf"},
      {"Infinity", "inf"},
      {"-infinity", "-inf"},
      {"infinit", refused},
      {"infinity+", refused},
      {"--inf", refused},
      {"-1e999", "-inf"},
      {"-1e-999", "-0"},
      {"4.9e-324", "4.9406564584124654e-324"},
      {"&#x31;<![CDATA[.5]]>", "1.5"},
      {"1\xFF", refused},
  };
  expect(cases, "real", "{\"real\":\"", "\",\"w\":64}");
}

TEST(XmlScalars, Dates) {
  const ScalarCase cases[] = {
      {"2001-01-01T00:00:00Z", "0"},
      {"2024-02-29T12:34:56Z", "730902896"},
      {"2000-12-31T23:59:59Z", "-1"},
      {"1-01-01T00:00:00Z", "-63113904000"},
      {"0001-01-01T00:00:00Z", "-63113904000"},
      {"-1-01-01T00:00:00Z", "-63177062400"},
      {"0-01-01T00:00:00Z", "-63145526400"},
      {"--01-01T00:00:00Z", "-63145526400"},  // no digits: the year 0
      {"--12-31T23:59:59Z", "-63113904001"},
      {"02001-01-01T00:00:00Z", "0"},
      {"10000-01-01T00:00:00Z", "252423993600"},
      {"2001-02-29T00:00:00Z", "5097600"},  // 1 March
      {"2001-01-00T00:00:00Z", "-86400"},   // the day before
      {"2001-01-99T00:00:00Z", "8467200"},
      {"2000-13-01T00:00:00Z", "0"},
      {"2001-00-01T00:00:00Z", "0"},  // the platform's table has a month 0 without days
      {"2001-01-01T24:00:00Z", "86400"},
      {"2001-01-01T00:00:61Z", "61"},
      {"", refused},
      {"-", refused},
      {"-01-01T00:00:00Z", refused},  // the year is -1, and the day is missing
      {"---01-01T00:00:00Z", refused},
      {" 2001-01-01T00:00:00Z", refused},
      {"2001-01-01T00:00:00Z ", refused},
      {"2001-01-01 00:00:00Z", refused},
      {"2001-01-01T00:00:00", refused},
      {"2001-01-01T00:00:00z", refused},
      {"2001-01-01T00:00:00.5Z", refused},
      {"2001-1-01T00:00:00Z", refused},
      {"2001-01-01T00:00:00+00:00", refused},
      {"--2001-01-01T00:00:00Z", refused},
      {"2001-0a-01T00:00:00Z", refused},
      {"2001-01-01T00-00-00Z", refused},
      {"2001-01-01T00:00:00&#90;", refused},
  };
  expect(cases, "date", "{\"date\":\"", "\"}");
}

TEST(XmlScalars, DatesOfAnyYear) {
  const auto dateIn = [](const std::string& year) {
    return dumpOf(plist("<date>" + year + "-01-01T00:00:00Z</date>"));
  };
  // Years beyond a trillion all give the same date.
  EXPECT_EQ(dateIn(std::string(400, '9')), dateIn("1000000000000"));
  EXPECT_EQ(dateIn("-" + std::string(400, '9')), dateIn("-1000000000000"));
  EXPECT_EQ(dateIn("1000000000000").substr(0, 13), "{\"date\":\"3.15");
}

TEST(XmlScalars, Data) {
  const ScalarCase cases[] = {
      {"", ""},
      {"AQID", "010203"},
      {"AQI=", "0102"},
      {"AQ==", "01"},
      {"AQ= =", "01"},
      {"AQ=", ""},
      {"A===", "00"},
      {"====", "00"},
      {"AQ=I", "010008"},
      {"AQ==AQID", "01010203"},
      {"AQ=!=", "0100"},  // ! is junk, and only the last = counts
      {"AQIDA", "010203"},
      {"AQIDAQI", "010203"},
      {"A-Q_I*D", "010203"},
      {"+/+/", "fbffbf"},
      {"AQID>", "010203"},
      {"A\vQ\fID", "010203"},
      {std::string_view("A\0QID", 5), "010203"},
      {"&#65;QID", "eb9408"},  // not an entity: & # ; are junk, 65QI is a group, D is left over
      {"\x80"
       "AQID",
       refused},
      {"AQID\xC3\xA9", refused},
      {"AQID<!-- c -->", refused},
      {"<![CDATA[AQID]]>", refused},
  };
  expect(cases, "data", "{\"data\":\"", "\"}");
}

}  // namespace
}  // namespace qz::toolkit
