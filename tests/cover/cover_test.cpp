// SPDX-License-Identifier: MIT
// The scenarios that cover a script: they pass, those of the examples on every toolkit, and notice
// changes.
#include "tools/cover/cover.hpp"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "tests/cover/passing.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::cover {
namespace {

namespace fs = std::filesystem;

/// A script of the repository and its window.
struct Covered {
  std::string script;
  std::string window;
  std::string assets;

  friend void PrintTo(const Covered& covered, std::ostream* out) { *out << covered.script; }
};

std::vector<Covered> coveredScripts() {
  const std::string source = QZ_SOURCE_DIR;
  std::vector<Covered> all = {
      {source + "/tests/data/scripts/first-steps.plist",
       source + "/examples/first-steps/host.plist", ""},
      {source + "/tests/data/scripts/photo-import.plist",
       source + "/examples/photo-import/host.plist", ""},
      {source + "/examples/built-window/script.plist", "",
       source + "/examples/built-window/assets.plist"},
      {source + "/examples/qt-host/tour.plist", source + "/examples/qt-host/tour-host.plist", ""}};
  for (const auto& folder : fs::directory_iterator(source + "/tests/check/corpus")) {
    const auto window = folder.path() / "window.plist";
    if (fs::exists(window)) all.push_back({folder.path() / "script.plist", window, ""});
  }
  return all;
}

/// Whether a script is one of the examples, not of the corpus.
bool isExample(const Covered& covered) {
  return covered.script.find("/corpus/") == std::string::npos;
}

check::CheckOptions optionsFor(const Covered& covered) {
  check::CheckOptions options;
  if (!covered.window.empty()) {
    options.stage.window = covered.window;
    options.resources = fs::path(covered.window).parent_path();
  }
  if (!covered.assets.empty()) options.stage.assets = covered.assets;
  return options;
}

Coverage coverageOf(const Covered& covered) {
  return coverScript(InputFile(covered.script, "a script"), optionsFor(covered), ".", {});
}

class CoverOf : public testing::TestWithParam<Covered> {
 protected:
  play::WorkingDirectory directory_;
};

TEST_P(CoverOf, Passes) {
  const Coverage coverage = coverageOf(GetParam());
  EXPECT_EQ(coverageOf(GetParam()).files, coverage.files) << "written again";
  EXPECT_TRUE(coverage.isComplete);
  EXPECT_GE(coverage.files.size(), 1U);
  EXPECT_GE(coverage.moves, coverage.steps - 1);
  for (const auto& [name, text] : coverage.files) directory_.write(name, text);
  EXPECT_EQ(firstFailureOn("memory"), "");
  if (!isExample(GetParam())) return;  // each toolkit with windows costs seconds
  ::setenv("QT_QPA_PLATFORM", "offscreen", 0);
  for (const std::string_view toolkit : driverNames()) {
    if (toolkit == "appkit" && !std::getenv("DISPLAY")) continue;
    EXPECT_EQ(firstFailureOn(toolkit), "") << toolkit;
  }
}

INSTANTIATE_TEST_SUITE_P(All, CoverOf, testing::ValuesIn(coveredScripts()),
                         [](const testing::TestParamInfo<Covered>& each) {
                           const fs::path script = each.param.script;
                           const bool isNamed = script.stem() != "script";
                           std::string name =
                               isNamed ? script.stem() : script.parent_path().filename();
                           std::replace(name.begin(), name.end(), '-', '_');
                           return name;
                         });

/// Returns the lines of a text.
std::vector<std::string> linesOf(const std::string& text) {
  std::istringstream in(text);
  std::vector<std::string> lines;
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

std::string without(const std::vector<std::string>& lines, std::size_t dropped) {
  std::string text;
  for (std::size_t i = 0; i < lines.size(); ++i) {
    if (i != dropped) text += lines[i] + '\n';
  }
  return text;
}

/// Whether a line of a script in XML is a whole command.
bool isCommand(const std::string& line) {
  return line.starts_with("    <array><string>") && line.ends_with("</array>");
}

TEST(Cover, NoticesEachCommandThatIsDropped) {
  const play::WorkingDirectory directory;
  const Covered original = coveredScripts().front();
  const std::string text = *wholeFile(original.script);
  directory.write("script.plist", text);
  Covered copy = original;
  copy.script = "script.plist";
  for (const auto& [name, scenario] : coverageOf(copy).files) directory.write(name, scenario);
  ASSERT_EQ(firstFailureOn("memory"), "");

  const auto lines = linesOf(text);
  std::size_t commands = 0;
  for (std::size_t i = 0; i < lines.size(); ++i) {
    if (!isCommand(lines[i])) continue;
    ++commands;
    directory.write("script.plist", without(lines, i));
    EXPECT_NE(firstFailureOn("memory"), "") << lines[i];
  }
  EXPECT_GE(commands, 50U);
}

}  // namespace
}  // namespace qz::tools::cover
