// SPDX-License-Identifier: MIT
#include "tools/check/witness.hpp"

#include <filesystem>
#include <sstream>

#include "tools/check/replay.hpp"
#include "tools/check/scenario_words.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

namespace fs = std::filesystem;

class Witness {
 public:
  Witness(const Finding& finding, const Setting& setting, const fs::path& script,
          const fs::path& directory)
      : finding_(finding), play_{setting, script, directory} {}

  std::string text() {
    out_ << "# " << finding_.code << ": " << oneLine(finding_.message)
         << "\n# Script: " << oneLine(play_.script.filename().string())
         << (finding_.list ? ", list " : "") << oneLine(finding_.list.value_or("")) << '\n';
    writeSetUp(play_, namesOfControls(), out_);
    writeMoves();
    return out_.str();
  }

 private:
  std::vector<std::string> namesOfControls() const {
    std::vector<std::string> names;
    for (std::size_t i = 0; i < play_.setting.plan.host.controls.size(); ++i) {
      names.push_back("c" + std::to_string(i));
    }
    return names;
  }

  void writeMoves() {
    out_ << "ignore log\n";
    const auto played = playPath(play_.setting, finding_.path);
    for (std::size_t i = 0; i < played.size(); ++i) {
      if (played[i].isEndless) {
        out_ << "ignore log\n# The next move runs lists without end: " << played[i].words << '\n';
        return;  // what the window shows then is not known
      }
      writeStep(finding_.path[i]);
      out_ << (played[i].raised ? " => raises" : "") << '\n';
    }
    writeExpectations(pictureAfter(play_.setting, finding_.path));
  }

  void writeStep(const Step& step) {
    const auto* press = std::get_if<PressMove>(&step);
    writeMove(play_, step, press ? "@" + std::to_string(press->control) : "", out_);
  }

  /// The place where the path ends.
  void writeExpectations(const walkthrough::StepPicture& picture) {
    out_ << "ignore log\nexpect engine.terminating " << yesNo(picture.ended) << '\n';
    if (picture.ended) return;
    for (std::size_t i = 0; i < picture.controls.size(); ++i) {
      const auto& view = picture.controls[i].view;
      const std::string control = "expect @" + std::to_string(i);
      out_ << control << ".tag " << view.tag << '\n'
           << control << ".hidden " << yesNo(view.hidden) << '\n';
      if (drivers::rowOf(view.kind).isControl) {
        out_ << control << ".enabled " << yesNo(view.enabled) << '\n';
      }
    }
  }

  const Finding& finding_;
  const WrittenPlay play_;
  std::ostringstream out_;
};

}  // namespace

WitnessWriter::WitnessWriter(std::string directory) : directory_(std::move(directory)) {
  std::error_code error;
  fs::create_directories(directory_, error);
  if (!fs::is_directory(directory_)) {
    throw Failure(ExitStatus::badInput, directory_ + ": expected a directory, which can be made");
  }
}

void WitnessWriter::write(const Verdict& verdict, const InputFile& file,
                          const CheckOptions& options) {
  const Script script(file.dictionary());
  const auto plan = walkthrough::planStage(options.stage, script.dictionary(), file.path());
  const Setting setting = settingOf(script, plan, resourcesFor(file, options));
  for (const Finding& finding : verdict.findings) {
    if (finding.path.empty()) continue;
    const std::string name =
        finding.code + "-" + std::to_string(++numbers_[finding.code]) + ".walk";
    replaceFile((fs::path(directory_) / name).string(),
                Witness(finding, setting, file.path(), directory_).text());
    ++count_;
  }
}

}  // namespace qz::tools::check
