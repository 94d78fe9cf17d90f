// SPDX-License-Identifier: MIT
// The command `test`.
#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "tools/commands.hpp"
#include "tools/reading_errors.hpp"
#include "tools/scenario/junit.hpp"
#include "tools/scenario/runner.hpp"
#include "tools/scenario/scenario_files.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

using scenario::LoadedFile;
using scenario::Report;
using scenario::Scenario;
using scenario::Verdict;

struct TestOptions {
  std::vector<std::string> paths;  // scenario files, and directories of them
  std::string toolkit = testToolkit();
  std::string filter;  // run only scenarios whose title contains this
  bool list = false;   // name the scenarios instead of running them
  bool verbose = false;
  bool noCheck = false;
  std::optional<std::string> junit;  // where to write a report
};

/// Opens the report. Called before anything runs, so that a bad path is reported at once.
std::ofstream openReport(const std::string& path) {
  std::ofstream stream(path, std::ios::binary);
  if (!stream) throw Failure(ExitStatus::badInput, path + ": the report cannot be written");
  return stream;
}

std::string place(const std::string& file, int line) {
  return oneLine(file) + ":" + std::to_string(line) + ": ";
}

void print(std::ostream& out, const Report& report) {
  if (report.verdict != Verdict::failed) return;
  out << place(report.file, report.failedLine) << oneLine(report.problem) << "\n    "
      << oneLine(report.statement) << '\n';
  // A title that is the file's name adds nothing.
  if (report.title != std::filesystem::path(report.file).filename().string()) {
    out << "    in " << place(report.file, report.line) << oneLine(report.title) << '\n';
  }
}

void printSummary(std::ostream& out, const std::vector<Report>& reports) {
  const auto count = [&](Verdict verdict) {
    return std::count_if(reports.begin(), reports.end(),
                         [&](const Report& report) { return report.verdict == verdict; });
  };
  out << count(Verdict::passed) << " passed, " << count(Verdict::failed) << " failed";
  if (const auto skipped = count(Verdict::skipped); skipped > 0) {
    out << ", " << skipped << " skipped";
  }
  out << std::endl;
}

template <class Use>
void forEachChosen(const std::vector<LoadedFile>& files, const std::string& filter, Use use) {
  for (const auto& file : files) {
    for (const auto& one : file.contents.scenarios) {
      if (scenario::titleOf(file, one).find(filter) != std::string::npos) use(file, one);
    }
  }
}

/// Throws a Failure if the filter matches no scenario: a run of none would look like a success.
void requireAny(const std::vector<LoadedFile>& files, const std::string& filter) {
  bool any = false;
  forEachChosen(files, filter, [&](const LoadedFile&, const Scenario&) { any = true; });
  if (any) return;
  throw Failure(ExitStatus::badInput,
                "no scenario has " + scenario::inQuotes(filter) + " in its title");
}

void list(const std::vector<LoadedFile>& files, const std::string& filter, std::ostream& out) {
  forEachChosen(files, filter, [&](const LoadedFile& file, const Scenario& one) {
    out << place(file.path, one.line) << oneLine(scenario::titleOf(file, one)) << '\n';
  });
}

std::vector<Report> run(const TestOptions& options, const std::vector<LoadedFile>& files,
                        std::ostream& out) {
  const scenario::Runner runner{[&] { return makeDriver(options.toolkit); }, options.toolkit,
                                [&](const std::string& file, const scenario::Statement& statement,
                                    const std::string& outcome) {
                                  if (!options.verbose) return;
                                  out << place(file, statement.at.line) << oneLine(statement.source)
                                      << "  [" << oneLine(outcome) << "]\n";
                                }};
  std::vector<Report> reports;
  forEachChosen(files, options.filter, [&](const LoadedFile& file, const Scenario& one) {
    if (options.verbose) out << "# " << oneLine(scenario::titleOf(file, one)) << '\n';
    reports.push_back(runner.run(file, one));
    print(out, reports.back());
  });
  return reports;
}

/// Adds the files that the statements copy into the resources and load as scripts. `copied` has the
/// files by their names there.
void addScripts(const std::string& file, const std::vector<scenario::Statement>& statements,
                std::map<std::string, std::string>& copied, std::set<std::string>& scripts) {
  for (const auto& statement : statements) {
    const auto& arguments = statement.arguments;
    const std::string_view syntax = scenario::statementKinds()[statement.form].syntax;
    if (syntax.starts_with("copy ")) {
      copied[arguments.text("FILE")] =
          (std::filesystem::path(file).parent_path() / arguments.text("PATH")).string();
    } else if (syntax.starts_with("load ") && arguments.has("TEXT")) {
      const auto script = copied.find(arguments.text("TEXT"));
      if (script != copied.end()) scripts.insert(script->second);
    }
  }
}

/// Writes what is surely wrong in the script files that the scenarios load. Scripts that are
/// written in a scenario are left out: scenarios try mistakes on purpose. So are images, which
/// scenarios make.
void writeScriptErrors(const TestOptions& options, const std::vector<LoadedFile>& files,
                       std::ostream& out) {
  std::set<std::string> scripts;
  for (const LoadedFile& file : files) {
    std::map<std::string, std::string> common;
    addScripts(file.path, file.contents.common, common, scripts);
    for (const Scenario& one : file.contents.scenarios) {
      auto copied = common;
      addScripts(file.path, one.statements, copied, scripts);
    }
  }
  const auto driver = requireDriver(options.toolkit);
  for (const std::string& script : scripts) {
    try {
      writeReadingErrors(steps::openScript(script).file, driver->toolkit(), out, {"unknown-image"});
    } catch (const Failure&) {
      // The scenario that loads the file says so.
    }
  }
}

/// Runs the scenarios. Writes their failures and the counts to `out`, and the errors in scenario
/// files to `problems`. Returns the tool's exit status. Throws a Failure if there is no such
/// toolkit, no scenario matches the filter, or the report cannot be written.
int runTests(const TestOptions& options, std::ostream& out, std::ostream& problems) {
  requireDriver(options.toolkit);  // reports an unknown toolkit even if nothing runs
  const auto read = scenario::readScenarios(options.paths);
  for (const auto& problem : read.problems) problems << oneLine(problem) << '\n';
  if (!read.problems.empty()) return static_cast<int>(ExitStatus::badInput);
  requireAny(read.files, options.filter);
  if (options.list) {
    list(read.files, options.filter, out);
    return static_cast<int>(ExitStatus::fine);
  }
  if (!options.noCheck) writeScriptErrors(options, read.files, problems);
  auto report = options.junit ? openReport(*options.junit) : std::ofstream();
  const auto reports = run(options, read.files, out);
  printSummary(out, reports);
  if (options.junit) {
    report << junitReport(reports);
    report.close();
    if (!report) throw Failure(ExitStatus::failed, *options.junit + ": the report was not written");
  }
  const bool failed = std::any_of(reports.begin(), reports.end(),
                                  [](const Report& one) { return one.verdict == Verdict::failed; });
  return static_cast<int>(failed ? ExitStatus::failed : ExitStatus::fine);
}

void describeTest(Command& command) {
  const auto options = std::make_shared<TestOptions>();
  command.arguments("FILE", options->paths, "Scenario files (.walk), or directories of them")
      .path()
      .file();
  addToolkitOption(command, options->toolkit, "The toolkit to run on");
  command.option("--filter", options->filter, "Run only scenarios whose title contains this");
  command.flag("--list", options->list, "Name the scenarios instead of running them");
  command.flag("--verbose", options->verbose, "Print every statement with its result");
  command.flag("--no-check", options->noCheck,
               "Do not say what can be read to be wrong in the scripts");
  command.option("--junit", options->junit, "Write a JUnit report to this file").path().file();
  command.action([options] { return runTests(*options, std::cout, std::cerr); });
}

}  // namespace

constexpr CommandEntry testCommand{"test", "Run scenarios and say which hold", describeTest};

}  // namespace qz::tools
