// SPDX-License-Identifier: MIT
// Scripts that could not be checked, in each format of the reports: who reads only the report must
// not take it for a success.

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>
#include <pugixml.hpp>

#include <sstream>
#include <string>
#include <vector>

#include "tools/check/report.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;
using Write = void (*)(const RunReport&, bool, std::ostream&);

const Unchecked missing{.script = "none.plist", .message = "none.plist: no such file"};
const Unchecked broken{.script = "a, b.plist",
                       .message = "a, b.plist:2:1: expected ',' or <\n>, found “100%”"};

std::string written(Write write, std::vector<Unchecked> unchecked, bool color = false) {
  std::ostringstream out;
  write({.scripts = {}, .unchecked = std::move(unchecked)}, color, out);
  return out.str();
}

TEST(UncheckedScripts, AreInJson) {
  const Json expected = {
      {"version", 1},
      {"scripts", Json::array()},
      {"unchecked", Json::array({{{"script", "none.plist"}, {"message", missing.message}},
                                 {{"script", "a, b.plist"}, {"message", broken.message}}})}};
  EXPECT_EQ(Json::parse(written(writeJson, {missing, broken})), expected);
}

Json notificationOf(const char* uri, const std::string& message) {
  const Json location = {{"physicalLocation", {{"artifactLocation", {{"uri", uri}}}}}};
  return {
      {"level", "error"}, {"message", {{"text", message}}}, {"locations", Json::array({location})}};
}

TEST(UncheckedScripts, MakeTheInvocationOfSarifUnsuccessful) {
  const Json run = Json::parse(written(writeSarif, {missing, broken}))["runs"][0];
  ASSERT_EQ(run["invocations"].size(), 1U);
  EXPECT_EQ(run["invocations"][0]["executionSuccessful"], false);
  EXPECT_EQ(run["invocations"][0]["toolExecutionNotifications"],
            Json::array({notificationOf("none.plist", missing.message),
                         notificationOf("a%2C%20b.plist", broken.message)}));
  EXPECT_EQ(run["results"], Json::array());
}

TEST(UncheckedScripts, AreErrorsInJunit) {
  const std::string text = written(writeJunit, {missing, broken});
  pugi::xml_document document;
  ASSERT_TRUE(document.load_buffer(text.data(), text.size())) << text;
  const struct {
    const char* script;
    const char* message;
  } suites[] = {{"none.plist", "none.plist: no such file"},
                {"a, b.plist", "a, b.plist:2:1: expected ',' or <\\n>, found “100%”"}};
  auto suite = document.child("testsuites").child("testsuite");
  for (const auto& expected : suites) {
    EXPECT_STREQ(suite.attribute("name").value(), expected.script);
    EXPECT_EQ(suite.attribute("tests").as_int(), 1);
    EXPECT_EQ(suite.attribute("failures").as_int(), 0);
    EXPECT_EQ(suite.attribute("errors").as_int(), 1);
    EXPECT_STREQ(suite.child("testcase").attribute("classname").value(), expected.script);
    const auto error = suite.child("testcase").child("error");
    EXPECT_STREQ(error.attribute("message").value(), expected.message);
    EXPECT_STREQ(error.text().get(), expected.message);
    suite = suite.next_sibling("testsuite");
  }
  EXPECT_FALSE(suite) << "there are more";
}

TEST(UncheckedScripts, AreErrorsInTheAnnotations) {
  EXPECT_EQ(written(writeGithub, {missing, broken}),
            "::error file=none.plist,title=not checked::none.plist: no such file\n"
            "::error file=a%2C b.plist,title=not checked::"
            "a, b.plist:2:1: expected ',' or <%0A>, found “100%25”\n");
}

TEST(UncheckedScripts, AreCountedAtTheEndOfTheText) {
  EXPECT_EQ(written(writeText, {missing, broken}),
            "2 of 2 scripts could not be checked: none.plist, a, b.plist\n");
  EXPECT_EQ(written(writeText, {missing, {.script = "\x1b[2J\n", .message = "a message"}}),
            "2 of 2 scripts could not be checked: none.plist, \\u{1b}[2J\\n\n");
}

TEST(UncheckedScripts, AreRedInTheTextIfAsked) {
  EXPECT_EQ(written(writeText, {missing, missing}, true),
            "\x1b[1;31m2 of 2 scripts could not be checked\x1b[0m: none.plist, none.plist\n");
}

TEST(UncheckedScripts, AreNotCountedInTheTextOfARunWithOneScript) {
  EXPECT_EQ(written(writeText, {missing}), "") << "standard error says it";
}

}  // namespace
}  // namespace qz::tools::check
