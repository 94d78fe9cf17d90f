// SPDX-License-Identifier: MIT
// The command `dump`: its output for every kind of value, and what it refuses.
#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <vector>

#include "play_files.hpp"
#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/readable_dump.hpp"

namespace qz::tools {
namespace {

using toolkit::ValueRef;

std::string readable(const ValueRef<>& value, bool color = false) {
  std::ostringstream out;
  writeReadableDump(*value, out, color);
  return out.str();
}

class DumpCommand : public testing::Test {
 protected:
  Result dump(const std::string& contents, std::vector<std::string> options = {}) const {
    directory_.write("file.plist", contents);
    std::vector<std::string> arguments{"dump", "file.plist"};
    arguments.insert(arguments.end(), options.begin(), options.end());
    return run(dumpCommand, arguments);
  }

 private:
  play::WorkingDirectory directory_;
};

TEST_F(DumpCommand, ShowsTheTypeOfEveryScalar) {
  using namespace std::string_view_literals;
  const struct {
    ValueRef<> value;
    const char* line;
  } cases[] = {
      {toolkit::String::make("Grüße"), "\"Grüße\""},
      {toolkit::String::make("5"), "\"5\""},
      {toolkit::String::make("a\"\\\t\n\r\x1b[2J"), "\"a\\\"\\\\\\t\\n\\u{d}\\u{1b}[2J\""},
      {toolkit::String::make("\0"sv), "\"\\u{0}\""},
      // NOLINTNEXTLINE(misc-misleading-bidirectional): misleading on purpose
      {toolkit::String::make("\u2028\u2029\u202E"), "\"\\u{2028}\\u{2029}\\u{202e}\""},
      {toolkit::String::make("\xED\xA0\x80z"), "\"\\u{d800}z\""},
      {toolkit::Number::withLong(-5), "-5"},
      {toolkit::Number::withUnsignedLong(18446744073709551615U), "18446744073709551615"},
      {toolkit::Number::withDouble(5), "5.0"},
      {toolkit::Number::withDouble(-0.5), "-0.5"},
      {toolkit::Number::withDouble(1e300), "1e+300"},
      {toolkit::Number::withFloat(5), "5.0f"},
      {toolkit::Number::withFloat(0.1F), "0.1f"},
      {toolkit::Number::withBool(true), "YES"},
      {toolkit::Number::withBool(false), "NO"},
      {toolkit::Date::make(0), "date 2001-01-01T00:00:00Z"},
      {toolkit::Data::make("\x01\xFF\x03\x04\x05"), "<01ff0304 05>"},
      {toolkit::Data::make(""), "<>"},
      {toolkit::Uid::make(7), "uid 7"},
      {toolkit::Null::make(), "null"},
  };
  for (const auto& c : cases) EXPECT_EQ(readable(c.value), std::string(c.line) + "\n");
}

TEST_F(DumpCommand, IndentsCollections) {
  const auto result = dump("{ 1 = (SET_TEXT, (a, {})); 2 = (); }");
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.out,
            "{\n"
            "    \"1\" = (\n"
            "        \"SET_TEXT\",\n"
            "        (\n"
            "            \"a\",\n"
            "            {}\n"
            "        )\n"
            "    );\n"
            "    \"2\" = ();\n"
            "}\n");
  EXPECT_EQ(readable(toolkit::Set::make({toolkit::Null::make()})), "{(\n    null\n)}\n");
  EXPECT_EQ(readable(toolkit::Set::make({})), "{()}\n");
}

TEST_F(DumpCommand, BreaksLongDataIntoLines) {
  const std::string line =
      "00000000 00000000 00000000 00000000 00000000 00000000 00000000 00000000";
  EXPECT_EQ(readable(toolkit::Data::make(std::string(32, '\0'))), "<" + line + ">\n");
  EXPECT_EQ(readable(toolkit::Data::make(std::string(33, '\0'))),
            "<\n    " + line + "\n    00\n>\n");
}

TEST_F(DumpCommand, PaintsOnlyWhenAsked) {
  const auto value = toolkit::Dictionary::make(
      {{toolkit::String::make("k"), toolkit::Array::make({toolkit::String::make("v")})}});
  EXPECT_EQ(readable(value, true),
            "{\n    \x1b[1m\"k\"\x1b[0m = (\n        \x1b[32m\"v\"\x1b[0m\n    );\n}\n");
}

TEST_F(DumpCommand, PrintsTheCanonicalLine) {
  EXPECT_EQ(dump("{ b = (x); a = <01>; }", {"--canonical"}).out,
            "{\"dict\":[[\"a\",{\"data\":\"01\"}],[\"b\",[\"x\"]]]}\n");
  EXPECT_EQ(dump("<plist><integer>5</integer></plist>", {"--canonical"}).out, "{\"int\":\"5\"}\n");
}

TEST_F(DumpCommand, TellsWhyAFileIsRefused) {
  const struct {
    const char* contents;
    std::vector<std::string> options;
    const char* line;
  } cases[] = {
      {"", {"--canonical"}, "file.plist: an empty file; expected a property list"},
      {"<plist>\n<dict>",
       {},
       "file.plist:2:7: expected a tag, found the end of the file (read as "
       "XML property list)"},
      {"(a)",
       {"--dictionary"},
       "file.plist:1:1: expected a property list (a dictionary), found an array of 1"},
  };
  for (const auto& c : cases) {
    const auto result = dump(c.contents, c.options);
    EXPECT_EQ(result.err, std::string("qz-walkthrough: ") + c.line + "\n");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.out, "");
  }
  EXPECT_EQ(run(dumpCommand, {"dump", "none.plist"}).status, 2);
}

TEST_F(DumpCommand, TakesTheDeepestNestingAndRefusesSharingWithoutBound) {
  const auto nested = [](int depth) {
    std::string text;
    for (int i = 0; i < depth; ++i) text += "<array>";
    for (int i = 0; i < depth; ++i) text += "</array>";
    return text;
  };
  EXPECT_EQ(dump(nested(512)).status, 0);
  EXPECT_EQ(dump(nested(513)).status, 1);

  ValueRef<> shared = toolkit::String::make("z");
  for (int i = 0; i < 100; ++i) shared = toolkit::Array::make({shared, shared});
  const auto result = dump(toolkit::writeBinaryPropertyList(shared), {"--canonical"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(
      result.err.find("file.plist: too large to write out: shared collections expand to more than"),
      std::string::npos)
      << result.err;
}

}  // namespace
}  // namespace qz::tools
