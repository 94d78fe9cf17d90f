// SPDX-License-Identifier: MIT
// Sources in several files.

#include <gtest/gtest.h>

#include <filesystem>

#include "tests/steps/source_folder.hpp"
#include "tools/steps/source_map.hpp"

namespace qz::tools::steps {
namespace {

/// A folder in which tour.yaml has a step, and includes what it says.
class IncludingFolder : public SourceFolder {
 public:
  void writeTour(const std::string& include) const {
    write("tour.yaml", "include: " + include + "\nsteps: {a: {next: {press: end}}}\n");
  }
  void writeCommon(const std::string& rest = "") const {
    write("common.yaml", std::string(head) + rest);
  }
};

std::vector<std::string> mistakesOf(const std::string& path) {
  try {
    openScript(path);
  } catch (const SourceRefused& refused) {
    return refused.messages();
  }
  return {};
}

TEST(Includes, EntriesOfAllFilesAreJoined) {
  const IncludingFolder folder;
  folder.writeTour("[common.yaml, more.yaml]");
  folder.writeCommon("every step: {text: Same}\n");
  folder.write("more.yaml",
               "include: common.yaml\nfragments: {f: {box: {state: on}}}\n"
               "steps: {b: {use: f, next: {press: a}}}\n");
  folder.write("tour.yaml", "include: [common.yaml, more.yaml]\nsteps: {a: {next: {press: b}}}\n");
  const Source source = readSource("tour.yaml");
  ASSERT_EQ(source.tour.steps.size(), 2U);
  EXPECT_EQ(source.tour.steps[0].name, "a");
  EXPECT_EQ(source.tour.steps[1].name, "b");
  EXPECT_EQ(source.tour.everyStep.controls[0].content->text, "Same");
  EXPECT_EQ(source.tour.steps[1].words.controls[2].isOn, true);
  EXPECT_EQ(source.files.paths(),
            (std::vector<std::string>{"tour.yaml", "common.yaml", "more.yaml"}));
}

TEST(Includes, PathsAreFromTheFileThatNamesThem) {
  const IncludingFolder folder;
  std::filesystem::create_directory("shared");
  std::filesystem::rename("host.plist", "shared/host.plist");
  folder.write("shared/window.yaml", SourceFolder::head);
  folder.write("shared/common.yaml", "include: window.yaml\n");
  folder.writeTour("shared/common.yaml");
  EXPECT_EQ(readSource("tour.yaml").stage.window, "shared/host.plist");
}

TEST(Includes, MistakesNameTheFileInWhichTheyAre) {
  const IncludingFolder folder;
  folder.writeTour("common.yaml");
  folder.writeCommon("every step: {nxt: {title: Next}}\n");
  EXPECT_EQ(mistakesOf("tour.yaml"),
            std::vector<std::string>{
                "common.yaml:3:14: expected the name of a control or a word such as “show”, found "
                "“nxt”; did you mean \"next\"?"});
  folder.writeCommon("steps: [\n");
  const auto messages = mistakesOf("tour.yaml");
  ASSERT_EQ(messages.size(), 1U);
  EXPECT_TRUE(messages[0].starts_with("common.yaml:")) << messages[0];
}

TEST(Includes, ThatCannotBeMadeAreMistakes) {
  const IncludingFolder folder;
  folder.writeCommon("include: [tour.yaml]\n");
  folder.writeTour("common.yaml");
  EXPECT_EQ(mistakesOf("tour.yaml"),
            std::vector<std::string>{
                "common.yaml:3:11: tour.yaml includes itself; expected another file"});
  folder.writeTour("/dev/zero");
  EXPECT_EQ(mistakesOf("tour.yaml"),
            std::vector<std::string>{
                "tour.yaml:1:10: /dev/zero: cannot be read; expected a part of a walk-through"});
  folder.writeTour("[comon.yaml, {}]");
  EXPECT_EQ(mistakesOf("tour.yaml"),
            (std::vector<std::string>{
                "tour.yaml:1:11: comon.yaml: cannot be read; expected a part of a walk-through",
                "tour.yaml:1:23: expected the name of a file, or a list of names, found a table"}));
}

TEST(Includes, ANameIsInOneFileOnly) {
  const IncludingFolder folder;
  folder.writeTour("common.yaml");
  folder.writeCommon("steps: {a: {}}\n");
  EXPECT_EQ(mistakesOf("tour.yaml"),
            std::vector<std::string>{
                "common.yaml:3:9: “a” is also in tour.yaml:2:9; expected one entry of this name"});
  folder.write("tour.yaml",
               "window: host.plist\ninclude: common.yaml\nsteps: {a: {next: {press: end}}}\n");
  folder.writeCommon();
  EXPECT_EQ(mistakesOf("tour.yaml"),
            std::vector<std::string>{"common.yaml:1:1: “window” is also in tour.yaml:1:9; expected "
                                     "one entry of this name"});
}

TEST(Includes, AreNotNestedEndlessly) {
  const IncludingFolder folder;
  for (int i = 0; i < 30; ++i) {
    folder.write(std::to_string(i) + ".yaml", "include: " + std::to_string(i + 1) + ".yaml\n");
  }
  folder.writeTour("0.yaml");
  const auto messages = mistakesOf("tour.yaml");
  ASSERT_FALSE(messages.empty());
  EXPECT_EQ(messages.back(),
            "18.yaml:1:10: files include each other too deeply; expected at most 20 levels");
}

TEST(Includes, AreWatchedAlsoBeforeTheyCanBeRead) {
  const IncludingFolder folder;
  folder.writeTour("shared/common.yaml");
  try {
    openScript("tour.yaml");
    FAIL() << "accepted";
  } catch (const SourceRefused& refused) {
    EXPECT_EQ(refused.paths(), (std::vector<std::string>{"tour.yaml", "shared/common.yaml"}));
  }
}

TEST(Includes, AMapNamesTheFile) {
  const IncludingFolder folder;
  folder.writeTour("common.yaml");
  folder.writeCommon("every step: {text: Hello}\n");
  const std::string map = sourceMap(openScript("tour.yaml"));
  EXPECT_NE(map.find(R"("file": "common.yaml",
     "line": 3,
     "column": 14)"),
            std::string::npos)
      << map;
}

TEST(SourceFiles, CountLinesAndCharactersOfEachFile) {
  SourceFiles files;
  const std::string line(3000, 'x');
  EXPECT_EQ(files.add("a", "é\n" + line + "\r\nz"), 0U);
  const Place second = files.add("b", "1");
  EXPECT_EQ(files.at(0).text(), "a:1:1");
  EXPECT_EQ(files.at(2).text(), "a:1:2");
  EXPECT_EQ(files.at(3 + 2500).text(), "a:2:2501");
  EXPECT_EQ(files.at(3 + 3002).text(), "a:3:1");
  EXPECT_EQ(files.at(second - 1).text(), "a:3:2");
  EXPECT_EQ(files.at(second).text(), "b:1:1");
}

}  // namespace
}  // namespace qz::tools::steps
