// SPDX-License-Identifier: MIT
// What is built of a source: tags that stay, short lists, names for the tools.

#include <gtest/gtest.h>

#include <set>

#include "tests/steps/source_folder.hpp"
#include "tools/steps/source_map.hpp"

namespace qz::tools::steps {
namespace {

std::set<std::string> keysOf(const ScriptFile& script) {
  const auto keys = script.file.dictionary()->allKeys();
  return {keys.begin(), keys.end()};
}

TEST(Building, TagsStayWhenStepsAreAddedElsewhere) {
  const SourceFolder folder;
  const auto before =
      keysOf(folder.open("steps: {a: {next: {press: b}}, b: {next: {press: c}, back: {press: "
                         "back}}, c: {next: {press: end}}}"));
  const auto after =
      keysOf(folder.open("steps: {a: {next: {press: b}}, b: {next: {press: c}, back: {press: "
                         "back}}, c: {next: {press: d}},"
                         " d: {next: {press: end}}}"));
  for (const std::string& key : before) EXPECT_TRUE(after.contains(key)) << key;
}

TEST(Building, IsTheSameEachTime) {
  const SourceFolder folder;
  const char* const source = "steps: {a: {text: Hello, next: {press: b}}, b: {next: {press: end}}}";
  EXPECT_EQ(folder.open(source).file.root()->description(),
            folder.open(source).file.root()->description());
}

TEST(Building, AStepThatChangesNothingSendsNothing) {
  const SourceFolder folder;
  const auto script = folder.open(
      "every step: {text: Same}\nsteps: {a: {next: {press: b}}, b: {next: {press: end}}}");
  const auto key = std::to_string(
      script.from->built.controlOfTag.rbegin()->first);  // of Next at a: its own tag ends at b
  const auto list = script.file.dictionary()->objectForKey(key)->description();
  EXPECT_NE(list.find("SET_TAG_FOR_OBJECT_ID"), std::string::npos) << list;
  EXPECT_EQ(list.find("SET_TEXT"), std::string::npos) << list;
}

TEST(Building, NamesEveryTagAndEveryListThatLeadsToAStep) {
  const SourceFolder folder;
  const auto script = folder.open(
      "steps: {a: {next: {press: b}}, b: {after 2 s: a, next: {press: end}, back: {press: back}}}");
  const auto names = script.names();
  std::set<std::string> controls;
  for (const auto& [tag, name] : names.controls) controls.insert(name);
  EXPECT_EQ(controls, (std::set<std::string>{"text", "picture", "box", "next", "back", "frame"}));
  std::multiset<std::string> steps;
  for (const auto& [key, step] : names.steps) steps.insert(step);
  // The start, Back and the wait lead to a; Next to b.
  EXPECT_EQ(steps, (std::multiset<std::string>{"a", "a", "a", "b"}));
}

TEST(Building, ControlsThatShareATagGetTagsOfTheirOwn) {
  const SourceFolder folder;
  folder.write("host.plist", R"((
    { class = NSTextField; frame = (0, 0, 90, 30); }, { class = NSTextField; frame = (0, 30, 90, 30); },
    { class = NSTextField; frame = (0, 60, 90, 30); }, { class = NSButton; tag = 4; frame = (0, 90, 90, 30); }))");
  folder.write("tour.yaml",
               "window: host.plist\ncontrols: {first: 0, third: {tag: 0, number: 3}, next: 4}\n"
               "steps: {a: {first: One, third: Three, next: {press: end}}}\n");
  const auto script = openScript("tour.yaml");
  std::set<std::string> controls;
  for (const auto& [tag, name] : script.names().controls) {
    if (tag != 0) controls.insert(name);
  }
  EXPECT_EQ(controls, (std::set<std::string>{"first", "third", "next"}));
  const std::string list = script.file.dictionary()->objectForKey("-1")->description();
  const auto retags = list.find("SET_TAG_FOR_OBJECT_ID");
  EXPECT_LT(retags, list.find("SET_TEXT_FOR_OBJECT_ID")) << list;
}

TEST(Building, PositionsAreThoseOfTheSource) {
  const SourceFolder folder;
  const auto script = folder.open("steps:\n  a: {text: Hello, next: {press: end}}\n");
  const auto end = script.file.dictionary()->objectForKey("4");
  EXPECT_EQ(script.file.placeOf(end), "tour.yaml:4:34");
}

TEST(Building, AMapSaysWhereListsAndCommandsComeFrom) {
  const SourceFolder folder;
  const auto script = folder.open("steps:\n  a: {next: {press: end}}\n");
  EXPECT_EQ(sourceMap(script), R"({
 "version": 1,
 "source": "tour.yaml",
 "controls": {
  "1": "text",
  "2": "picture",
  "3": "box",
  "4": "next",
  "5": "back",
  "6": "frame"
 },
 "lists": {
  "0": {
   "line": 4,
   "column": 3,
   "step": "a",
   "commands": [
    {
     "line": 4,
     "column": 3
    },
    {
     "line": 4,
     "column": 3
    },
    {
     "line": 4,
     "column": 3
    }
   ]
  },
  "3": {
   "line": 4,
   "column": 3,
   "commands": []
  },
  "4": {
   "line": 4,
   "column": 21,
   "commands": [
    {
     "line": 4,
     "column": 21
    }
   ]
  }
 }
}
)");
}

TEST(Building, CanStartAtAnyStep) {
  const SourceFolder folder;
  folder.writeSource("steps: {a: {next: {press: b}}, b: {next: {press: end}}}");
  const auto script = openScript("tour.yaml", {"b"});
  EXPECT_EQ(script.names().stepOf(script.from->built.startKeys.front()), "b");
  EXPECT_THROW(openScript("tour.yaml", {"c"}), Failure);
}

}  // namespace
}  // namespace qz::tools::steps
