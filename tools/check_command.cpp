// SPDX-License-Identifier: MIT
// The command `check`: its options, and the order of its work.
#include <algorithm>
#include <atomic>
#include <filesystem>
#include <iostream>
#include <limits>
#include <list>
#include <memory>
#include <optional>
#include <thread>

#include "tools/check/baseline.hpp"
#include "tools/check/check.hpp"
#include "tools/check/explanations.hpp"
#include "tools/check/report.hpp"
#include "tools/check/witness.hpp"
#include "tools/check_progress.hpp"
#include "tools/commands.hpp"
#include "tools/stage_arguments.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/terminal.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools {
namespace {

using check::CheckOptions;
using check::Severity;

// Nothing was found, but not everything was looked at.
constexpr int notComplete = 3;

// More would cost more than they save.
constexpr std::size_t mostThreads = 256;

struct CommandOptions {
  std::vector<std::string> scripts;
  CheckOptions check;
  std::string format = "text";
  Severity failOn = Severity::warning;
  std::optional<std::string> witness;  // the directory of the scenarios
  std::optional<std::string> baseline;
  bool updateBaseline = false;
  std::optional<std::string> explain;  // a code
};

/// A script that is checked, and what came of it.
struct Job {
  std::optional<InputFile> file;
  CheckOptions options;  // with the window that a source names
  check::Verdict verdict;
  std::optional<Failure> failure;  // why it could not be checked
};

std::size_t positive(const std::string& option, const std::string& text) {
  const auto number = walkthrough::parseNumber<std::size_t>(text);
  if (!number || *number == 0) {
    throw UsageError(option + ": expected a whole number above 0, found " + quote(text));
  }
  return *number;
}

double positiveReal(const std::string& option, const std::string& text) {
  const auto number = walkthrough::parseNumber<double>(text);
  if (!number || !(*number > 0)) {
    throw UsageError(option + ": expected a number above 0, found " + quote(text));
  }
  return *number;
}

std::string formatNames() {
  std::vector<std::string> names;
  for (const auto& format : check::reportFormats()) names.emplace_back(format.name);
  return enumerate(names);
}

const check::ReportFormat& formatNamed(const std::string& name) {
  static const auto formats = check::reportFormats();
  const auto found = std::find_if(formats.begin(), formats.end(),
                                  [&](const auto& format) { return format.name == name; });
  if (found != formats.end()) return *found;
  throw Failure(ExitStatus::badInput,
                "--format: expected " + formatNames() + ", found " + quote(name));
}

int statusOf(const std::vector<Job>& jobs, Severity failOn) {
  bool complete = true;
  for (const Job& job : jobs) {
    if (job.failure) return static_cast<int>(job.failure->status());
  }
  for (const Job& job : jobs) {
    complete &= job.verdict.explored.complete;
    for (const auto& finding : job.verdict.findings) {
      if (finding.severity >= failOn) return static_cast<int>(ExitStatus::failed);
    }
  }
  return complete ? static_cast<int>(ExitStatus::fine) : notComplete;
}

/// Reads the script and its window. On the main thread, because Qt reads forms only there.
void openJob(const std::string& path, const CheckOptions& options, Job& job) {
  try {
    const steps::ScriptFile script = steps::openScript(path, options.startKeys);
    job.file.emplace(script.file);
    job.options = options;
    auto& stage = job.options.stage = script.stage(options.stage);
    if (script.from) {
      job.options.standIn = false;
      auto& keys = job.options.startKeys = script.from->built.startKeys;
      keys.resize(std::max<std::size_t>(options.startKeys.size(), 1));
    }
    if (!stage.window) return;
    stage.host =
        std::make_shared<walkthrough::HostWindow>(walkthrough::readHostWindow(*stage.window));
  } catch (const Failure& failure) {
    job.failure = failure;
  }
}

void checkOne(const std::string& path, unsigned threads, ProgressLine& line, Job& job) {
  if (job.failure) return;
  check::ExplorationHooks hooks;
  hooks.report = [&](const check::Progress& progress) { line.show(path, progress); };
  hooks.isCancelled = Interruption::isWanted;
  job.options.threads = threads;
  try {
    job.verdict = checkScript(*job.file, job.options, hooks);
  } catch (const Failure& failure) {
    job.failure = failure;
  }
}

/// Checks the scripts, several at once. One that cannot be read does not stop the others.
std::vector<Job> checkAll(const CommandOptions& options) {
  const Interruption interruption;
  ProgressLine line;
  std::vector<Job> jobs(options.scripts.size());
  const auto workers =
      static_cast<unsigned>(std::min<std::size_t>(options.check.threads, jobs.size()));
  const unsigned threads = std::max(1U, options.check.threads / workers);
  for (std::size_t i = 0; i < jobs.size(); ++i) openJob(options.scripts[i], options.check, jobs[i]);
  std::atomic<std::size_t> next = 0;
  const auto work = [&] {
    for (std::size_t i = next++; i < jobs.size(); i = next++) {
      checkOne(options.scripts[i], threads, line, jobs[i]);
    }
  };
  std::vector<std::jthread> others;
  for (unsigned i = 1; i < workers; ++i) others.emplace_back(work);
  work();
  return jobs;
}

void mergeAllowances(std::vector<Job>& jobs) {
  std::vector<std::pair<std::string, std::vector<check::Finding>*>> scripts;
  for (Job& job : jobs) {
    if (!job.failure) scripts.emplace_back(job.verdict.path, &job.verdict.findings);
  }
  check::mergeUnneeded(scripts);
}

check::Baseline newBaseline(const std::string& path) {
  const auto folder = std::filesystem::absolute(path).parent_path();
  if (std::filesystem::is_directory(folder)) return check::Baseline::empty(path);
  throw Failure(ExitStatus::badInput,
                path + ": cannot be written; expected a path in a directory that is there");
}

/// Returns the baseline of the options, if they name one. Throws a Failure if it cannot be read, or
/// if a new one could not be written.
std::optional<check::Baseline> baselineOf(const CommandOptions& options) {
  if (!options.baseline) return std::nullopt;
  const bool isNew = options.updateBaseline && !std::filesystem::exists(*options.baseline);
  return isNew ? newBaseline(*options.baseline) : check::Baseline::read(*options.baseline);
}

void applyBaseline(check::Baseline& baseline, bool isUpdated, std::vector<Job>& jobs) {
  for (Job& job : jobs) {
    if (job.failure) continue;
    if (isUpdated) baseline.replace(job.verdict.path, job.verdict.findings);
    job.verdict.inBaseline = baseline.takeBack(job.verdict.path, job.verdict.findings);
  }
  if (isUpdated) baseline.write();
}

void writeWitnesses(check::WitnessWriter& writer, const std::vector<Job>& jobs) {
  for (const Job& job : jobs) {
    if (!job.failure) writer.write(job.verdict, *job.file, job.options);
  }
}

check::RunReport reportOf(const CommandOptions& options, const std::vector<Job>& jobs) {
  check::RunReport run;
  for (std::size_t i = 0; i < jobs.size(); ++i) {
    if (const auto& failure = jobs[i].failure) {
      run.unchecked.push_back({options.scripts[i], failure->what()});
    } else {
      run.scripts.push_back({jobs[i].verdict, *jobs[i].file,
                             playStageArguments(options.check.stage, options.check.resources),
                             options.failOn});
    }
  }
  return run;
}

[[noreturn]] void wrongCode(const std::string& code) {
  std::vector<std::string> names;
  std::vector<std::string_view> candidates;
  for (const check::Code& each : check::codes()) {
    names.emplace_back(each.name);
    candidates.push_back(each.name);
  }
  const auto suggestion = didYouMean(code, candidates);
  throw Failure(ExitStatus::badInput,
                "--explain: no finding has the code " + quote(code) +
                    (suggestion.empty() ? "; expected " : suggestion + " Expected ") +
                    enumerate(names));
}

int explain(const std::string& code) {
  const auto text = check::explanationOf(code);
  if (!text) wrongCode(code);
  std::cout << *text;
  return static_cast<int>(ExitStatus::fine);
}

void requireSense(const CommandOptions& options) {
  if (options.scripts.empty()) {
    throw Failure(ExitStatus::badInput, "SCRIPT is required; see qz-walkthrough check --help");
  }
  if (options.updateBaseline && !options.baseline) {
    throw Failure(ExitStatus::badInput, "--update-baseline requires --baseline FILE");
  }
}

int runCheck(const CommandOptions& options) {
  if (options.explain) return explain(*options.explain);
  requireSense(options);
  // A mistake in these must not cost the time of the exploration.
  const auto& format = formatNamed(options.format);
  auto baseline = baselineOf(options);
  auto witnesses =
      options.witness ? std::optional<check::WitnessWriter>(*options.witness) : std::nullopt;
  auto jobs = checkAll(options);
  mergeAllowances(jobs);
  if (baseline) applyBaseline(*baseline, options.updateBaseline, jobs);
  if (witnesses) writeWitnesses(*witnesses, jobs);
  const auto run = reportOf(options, jobs);
  format.write(run, outputShowsColor(), std::cout);
  std::cout.flush();
  for (const auto& each : run.unchecked) {
    std::cerr << "qz-walkthrough: " << oneLine(each.message) << '\n';
  }
  return statusOf(jobs, options.failOn);
}

void addWindowOptions(Command& command, CheckOptions& options) {
  auto [window, assets] = addStageOptions(command, options.stage, options.resources);
  command
      .flag("--stand-in", options.standIn,
            "Check without a window: make one from the script, and say nothing about the tags, "
            "kinds and looks of its controls")
      .excludes(window)
      .excludes(assets);
  options.toolkit = testToolkit();
  addToolkitOption(command, options.toolkit,
                   "The toolkit whose fonts and images the script may use");
}

void addExploringOptions(Command& command, CheckOptions& options) {
  command
      .repeated(
          "--start", [&](const std::string& key) { options.startKeys.push_back(key); },
          "A list, or a step of a source, with which the walk-through may start (default: the "
          "smallest tag, or the first step)")
      .valueName("KEY")
      .scriptKey();
  command
      .taken(
          "--limit", [&](const std::string& n) { options.limits.places = positive("--limit", n); },
          "Stop after this many places (default: 1000000)")
      .valueName("PLACES");
  command
      .taken(
          "--memory",
          [&](const std::string& n) {
            constexpr std::size_t most = std::numeric_limits<std::size_t>::max() >> 20U;
            options.limits.bytes = std::min(positive("--memory", n), most) << 20U;
          },
          "Stop when the places take this much memory (default: 4096)")
      .valueName("MEGABYTES");
  command
      .taken(
          "--seconds",
          [&](const std::string& s) { options.limits.seconds = positiveReal("--seconds", s); },
          "Stop after this time (default: never)")
      .valueName("SECONDS");
  command
      .taken(
          "--words-per-minute",
          [&](const std::string& n) {
            options.wordsPerMinute = positiveReal("--words-per-minute", n);
          },
          "How fast users read (default: 200)")
      .valueName("WORDS");
  options.threads = std::max(1U, std::thread::hardware_concurrency());
  command
      .taken(
          "--threads",
          [&](const std::string& n) {
            options.threads =
                static_cast<unsigned>(std::min(positive("--threads", n), mostThreads));
          },
          "How many threads explore (default: one a processor); the result is the same")
      .valueName("COUNT");
}

void setFailOn(CommandOptions& options, const std::string& name) {
  const auto severity = check::severityNamed(name);
  if (!severity) {
    throw UsageError("--fail-on: expected error, warning or note, found " + quote(name));
  }
  options.failOn = *severity;
}

void addAnswerOptions(Command& command, CommandOptions& options) {
  std::vector<std::string_view> formats;
  for (const auto& format : check::reportFormats()) formats.push_back(format.name);
  command.option("--format", options.format, "The format of the report: " + formatNames())
      .valueName("FORMAT")
      .choices(formats)
      .showDefault();
  command
      .option("--witness", options.witness,
              "Write a scenario for each finding that has a path, to replay it with `test`")
      .valueName("DIR")
      .directory();
  command
      .taken(
          "--fail-on", [&](const std::string& name) { setFailOn(options, name); },
          "The least severity that fails: error, warning or note (default: warning)")
      .valueName("SEVERITY")
      .choices({"error", "warning", "note"});
}

void addAuthorsOptions(Command& command, CommandOptions& options) {
  std::vector<std::string_view> codes;
  for (const check::Code& code : check::codes()) codes.push_back(code.name);
  command
      .option("--expect", options.check.expectations,
              "What must hold when the script is played (default: check.expect beside the script)")
      .valueName("FILE")
      .file();
  command
      .repeated(
          "--allow",
          [&](const std::string& text) {
            options.check.allowances.push_back(check::parseAllowance(text, "--allow"));
          },
          "Take back the findings of a code, or those of one list")
      .valueName("CODE[=KEY]")
      .choices(codes);
  command
      .option("--baseline", options.baseline,
              "Take back the findings that this file has, so that only new ones fail")
      .valueName("FILE")
      .file();
  command.flag("--update-baseline", options.updateBaseline,
               "Write the findings to the file of --baseline");
  command
      .option("--explain", options.explain, "Print what a code means and how to mend it, and end")
      .valueName("CODE")
      .choices(codes);
}

void describeCheck(Command& command) {
  const auto options = std::make_shared<CommandOptions>();
  command
      .arguments("SCRIPT", options->scripts,
                 "The scripts, property lists; or their sources, YAML files")
      .file()
      .notRequired();
  addWindowOptions(command, options->check);
  addExploringOptions(command, options->check);
  addAnswerOptions(command, *options);
  addAuthorsOptions(command, *options);
  command.action([options] {
    auto& check = options->check;
    if (!check.stage.window && !check.stage.assets) check.standIn = true;
    return runCheck(*options);
  });
}

}  // namespace

constexpr CommandEntry checkCommand{
    "check", "Say what is wrong with scripts: explore everything that a user can do",
    describeCheck};

}  // namespace qz::tools
