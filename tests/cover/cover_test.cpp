// SPDX-License-Identifier: MIT
// The scenarios that cover a script: they pass on every toolkit of the build, and notice changes.
#include "tools/cover/cover.hpp"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "tests/tools/play_files.hpp"
#include "tools/scenario/runner.hpp"
#include "tools/scenario/scenario_files.hpp"
#include "tools/support/drivers.hpp"
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

/// Runs the scenarios of the present directory, and returns what fails.
std::string failuresOn(std::string_view toolkit) {
  const scenario::Runner runner{
      [&] { return makeDriver(std::string(toolkit)); }, std::string(toolkit),
      [](const std::string&, const scenario::Statement&, const std::string&) {}};
  const auto read = scenario::readScenarios({"."});
  std::string failures;
  for (const std::string& problem : read.problems) failures += problem + "\n";
  for (const scenario::LoadedFile& file : read.files) {
    for (const scenario::Scenario& each : file.contents.scenarios) {
      const scenario::Report report = runner.run(file, each);
      if (report.verdict == scenario::Verdict::passed) continue;
      failures +=
          report.file + ":" + std::to_string(report.failedLine) + ": " + report.problem + "\n";
    }
  }
  return failures;
}

class Covers : public testing::TestWithParam<Covered> {
 protected:
  play::WorkingDirectory directory_;
};

TEST_P(Covers, PassOnEveryToolkit) {
  const Coverage coverage = coverageOf(GetParam());
  EXPECT_TRUE(coverage.isComplete);
  EXPECT_GE(coverage.files.size(), 1U);
  EXPECT_GE(coverage.moves, coverage.steps - 1);
  for (const auto& [name, text] : coverage.files) directory_.write(name, text);
  ::setenv("QT_QPA_PLATFORM", "offscreen", 0);
  for (const std::string_view toolkit : driverNames()) {
    if (toolkit == "appkit" && !std::getenv("DISPLAY")) continue;
    // Its font Menlo is known to the memory toolkit alone.
    if (toolkit != "memory" && GetParam().script.find("html-tour") != std::string::npos) continue;
    EXPECT_EQ(failuresOn(toolkit), "") << toolkit;
  }
}

TEST_P(Covers, AreTheSameWhenWrittenAgain) {
  EXPECT_EQ(coverageOf(GetParam()).files, coverageOf(GetParam()).files);
}

INSTANTIATE_TEST_SUITE_P(All, Covers, testing::ValuesIn(coveredScripts()),
                         [](const testing::TestParamInfo<Covered>& each) {
                           const fs::path script = each.param.script;
                           const bool isNamed = script.stem() != "script";
                           std::string name =
                               isNamed ? script.stem() : script.parent_path().filename();
                           std::replace(name.begin(), name.end(), '-', '_');
                           return name;
                         });

}  // namespace
}  // namespace qz::tools::cover
