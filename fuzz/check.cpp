// SPDX-License-Identifier: MIT
// Checks any script: over a window made from the script itself, and over a window with a control of
// each kind.
//
// An input is a script in any format. Scripts with very many controls, and those whose lists run
// very long, are skipped: checking them takes longer than a fuzzer should.
#include "tools/check/check.hpp"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <optional>
#include <sstream>
#include <string>
#include <string_view>
#include <variant>

#include "drivers/memory/memory_driver.hpp"
#include "fuzz/require.hpp"
#include "fuzz/run_lengths.hpp"
#include "qz/drivers/view_kinds.hpp"
#include "qz/toolkit/exception.hpp"
#include "tools/check/report.hpp"
#include "tools/exploration/world.hpp"
#include "tools/support/drivers.hpp"
#include "tools/walkthrough/stand_in.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::check {

namespace {

using fuzz::require;

constexpr std::size_t mostPlaces = 300;  // enough for a round that several threads share
constexpr std::size_t mostControls = 40;
constexpr std::size_t longestPath = 100;       // moves; playing a longer one takes too long
constexpr double longestWait = 24 * 3600.0;    // seconds; the flasher ticks twice a second
constexpr double roundingOfTimers = 1.0 / 64;  // seconds

/// The files of one run of the fuzzer, which checks read by their paths.
class Files {
 public:
  Files() {
    std::string name = (parent() / "fuzz-check-XXXXXX").string();
    require(::mkdtemp(name.data()) != nullptr, "a directory for the files can be made");
    directory_ = name;
    write(window(), windowOfAllKinds());
  }
  ~Files() {
    std::error_code ignored;
    std::filesystem::remove_all(directory_, ignored);
  }
  Files(const Files&) = delete;
  Files& operator=(const Files&) = delete;

  void writeScript(std::string_view bytes) const { write(script(), bytes); }

  std::string script() const { return (directory_ / "script.plist").string(); }
  std::string window() const { return (directory_ / "window.plist").string(); }

 private:
  static void write(const std::string& path, std::string_view bytes) {
    std::ofstream(path, std::ios::binary) << bytes;
  }

  // Files in memory keep the runs fast.
  static std::filesystem::path parent() {
    const std::filesystem::path inMemory = "/dev/shm";
    return is_directory(inMemory) ? inMemory : std::filesystem::temp_directory_path();
  }

  /// Returns a window with a control of each kind and a second button, tagged from 1.
  static std::string windowOfAllKinds() {
    std::string controls;
    int tag = 0;
    const auto add = [&](std::string_view kind) {
      ++tag;
      controls += (tag == 1 ? "" : ",\n") + std::string("{ class = \"") + std::string(kind) +
                  "\"; tag = " + std::to_string(tag) + "; frame = (0, " + std::to_string(20 * tag) +
                  ", 90, 18); }";
    };
    for (const drivers::ViewKindRow& row : drivers::viewKinds) add(row.name);
    add(drivers::rowOf(drivers::ViewKind::button).name);
    return "(\n" + controls + "\n)\n";
  }

  std::filesystem::path directory_;
};

/// Plays paths as a user would, and requires that each move is possible.
class Player {
 public:
  Player(const Script& script, const walkthrough::StagePlan& plan) : stage_(driver_, plan) {
    stage_.engine().setPlistDictionary(script.dictionary()->copy(toolkit::Mutability::changeable));
  }

  /// Plays the first `moves` moves of a path.
  void play(const Path& path, std::size_t moves) {
    for (std::size_t i = 0; i < moves; ++i) {
      const auto* const wait = std::get_if<WaitMove>(&path[i]);
      if (wait && wait->seconds > longestWait) return;
      require(std::holds_alternative<StartMove>(path[i]) == (i == 0), "a path begins with a start");
      std::visit([this](const auto& move) { make(move); }, path[i]);
    }
  }

 private:
  void make(const StartMove& start) {
    attempt([&] { stage_.load(walkthrough::noFile, start.key); });
  }

  void make(const PressMove& press) {
    const auto picture = walkthrough::takePicture(driver_, stage_.engine(), "");
    require(!picture.ended && picture.window && picture.window->visible,
            "a press is before the end");
    require(press.control < picture.controls.size(), "a press is one of a control of the window");
    const drivers::ViewPicture& view = picture.controls[press.control].view;
    require(drivers::isButton(view.kind) && !view.hidden && view.enabled && view.tag == press.tag,
            "a press is one of a button that the user can press");
    attempt([&] {
      driver_.click(stage_.engine().tutorialWindow()->contentView()->subviews()[press.control]);
    });
  }

  void make(const WaitMove& wait) {
    const auto picture = walkthrough::takePicture(driver_, stage_.engine(), "");
    require(!picture.ended && !picture.timers.empty(), "a wait is one for a timer");
    require(std::abs(picture.timers.front().timeLeft - wait.seconds) < roundingOfTimers,
            "a wait is one until the first timer fires");
    attempt([&] { driver_.advance(wait.seconds); });
  }

  template <class Act>
  static void attempt(Act act) {
    try {
      act();
    } catch (const toolkit::Exception&) {
      // A mistake of the script; the host's event loop continues.
    }
  }

  drivers::MemoryDriver driver_;
  walkthrough::Stage stage_;
};

CheckOptions optionsOver(const std::optional<std::string>& window, unsigned threads) {
  CheckOptions options;
  options.stage.window = window;
  options.toolkit = testToolkit();
  options.limits.places = mostPlaces;
  options.threads = threads;
  return options;
}

/// Returns the reports of a verdict in all formats.
std::string reportsOf(const Verdict& verdict, const InputFile& file) {
  std::string reports;
  for (const ReportFormat& format : reportFormats()) {
    std::ostringstream report;
    const RunReport run{.scripts = {{verdict, file, "", Severity::warning}},
                        .unchecked = {{.script = "none.plist", .message = "none.plist: no file"}}};
    format.write(run, false, report);
    if (format.name == "json" || format.name == "sarif") {
      require(nlohmann::json::accept(report.str()), std::string(format.name) + " is JSON");
    }
    reports += report.str();
  }
  return reports;
}

void playPaths(const Verdict& verdict, const Script& script, const walkthrough::StagePlan& plan) {
  for (const Finding& finding : verdict.findings) {
    require(codeNamed(finding.code) != nullptr, "a finding has a known code");
    for (const Path& path : {finding.path, finding.otherPath}) {
      if (path.empty() || path.size() > longestPath) continue;
      // The last move of this path runs lists without end.
      const bool isEndless = finding.code == "endless-chain";
      Player(script, plan).play(path, path.size() - (isEndless ? 1 : 0));
    }
  }
}

void check(const InputFile& file, const Script& script, const std::optional<std::string>& window) {
  const CheckOptions options = optionsOver(window, 1);
  const Verdict verdict = checkScript(file, options, {});
  const Verdict again = checkScript(file, optionsOver(window, 2), {});
  require(reportsOf(verdict, file) == reportsOf(again, file),
          "one thread and two threads find the same");
  playPaths(verdict, script, planStage(options.stage, script.dictionary(), file.path()));
}

bool isQuickToCheck(const Script& script) {
  return walkthrough::standInWindow(script.dictionary()).controls.size() <= mostControls &&
         fuzz::RunLengths(script.dictionary()).areSmallExcept(endlessChains(script.dictionary()));
}

}  // namespace

/// Checks the script; NO if the bytes are not one that the fuzzer checks.
bool checkBytes(std::string_view bytes) {
  static const Files files;
  files.writeScript(bytes);
  std::optional<InputFile> file;
  try {
    file.emplace(files.script(), "a script");
    static_cast<void>(file->dictionary());
  } catch (const Failure&) {
    return false;  // not a property list, or not a dictionary
  }
  const Script script(file->dictionary());
  if (!isQuickToCheck(script)) return false;
  try {
    check(*file, script, std::nullopt);
    check(*file, script, files.window());
  } catch (const Failure& failure) {
    require(false, std::string("a script can be checked: ") + failure.what());
  }
  return true;
}

}  // namespace qz::tools::check

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  return qz::tools::check::checkBytes({reinterpret_cast<const char*>(data), size}) ? 0 : -1;
}
