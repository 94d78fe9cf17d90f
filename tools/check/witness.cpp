// SPDX-License-Identifier: MIT
#include "tools/check/witness.hpp"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <filesystem>
#include <sstream>

#include "qz/property_list/scalars.hpp"
#include "tools/check/replay.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;
using drivers::Caption;
using walkthrough::HostControl;

/// Returns the text as a quoted word of a scenario.
std::string word(const std::string& text) {
  return Json(text).dump(-1, ' ', false, Json::error_handler_t::replace);
}

std::string yesNo(bool value) { return value ? "YES" : "NO"; }

std::string numberWord(double value) { return Json(value).dump(); }

std::string rectangle(const toolkit::Rect& rect) {
  return numberWord(rect.x) + ' ' + numberWord(rect.y) + ' ' + numberWord(rect.width) + ' ' +
         numberWord(rect.height);
}

/// Returns a description of a window, which has only texts and numbers, as JSON.
Json jsonOf(const toolkit::ValueRef<>& value) {
  if (const auto list = toolkit::asArray(value)) {
    Json items = Json::array();
    for (const auto& element : list->elements()) items.push_back(jsonOf(element));
    return items;
  }
  if (const auto text = toolkit::asString(value)) return std::string(text->text());
  return value->doubleValue();
}

Json jsonOf(const toolkit::ValueRef<toolkit::Dictionary>& description) {
  Json entries = Json::object();
  for (const std::string& key : description->allKeys()) {
    entries[key] = jsonOf(description->objectForKey(key));
  }
  return entries;
}

/// Returns the files whose names, with or without their extensions, are texts in the script.
std::vector<fs::path> imagesOf(const Script& script, const fs::path& resources) {
  std::set<std::string> texts;
  for (const ScriptList& list : script.lists()) {
    for (const Element& element : list.elements) {
      for (std::size_t i = 0; i < element.parameterCount(); ++i) {
        if (const auto text = toolkit::asString(element.parameter(i))) {
          texts.insert(std::string(text->text()));
        }
      }
    }
  }
  std::vector<fs::path> images;
  std::error_code error;
  for (const auto& file : fs::directory_iterator(resources, error)) {
    const bool isNamed = texts.contains(file.path().filename().string()) ||
                         texts.contains(file.path().stem().string());
    if (isNamed && file.is_regular_file(error)) images.push_back(file.path());
  }
  std::sort(images.begin(), images.end());
  return images;
}

class Witness {
 public:
  Witness(const Finding& finding, const Setting& setting, const fs::path& script,
          const fs::path& directory)
      : finding_(finding), setting_(setting), script_(script), directory_(directory) {}

  std::string text() {
    out_ << "# " << finding_.code << ": " << oneLine(finding_.message)
         << "\n# Script: " << oneLine(script_.filename().string())
         << (finding_.list ? ", list " : "") << oneLine(finding_.list.value_or("")) << '\n';
    writeFiles();
    writeWindow();
    writeMoves();
    return out_.str();
  }

 private:
  void writeFiles() {
    writeCopy(script_);
    for (const fs::path& image : imagesOf(setting_.script, setting_.resources)) {
      if (image.filename() != script_.filename()) writeCopy(image);
    }
  }

  void writeCopy(const fs::path& file) {
    const auto path = fs::absolute(file).lexically_proximate(fs::absolute(directory_));
    out_ << "copy " << word(file.filename().string()) << ' ' << word(path.generic_string()) << '\n';
  }

  void writeWindow() {
    if (setting_.plan.sheet) out_ << "window parent\n";
    const std::string parent = setting_.plan.sheet ? " parent" : "";
    if (setting_.plan.description) {
      out_ << "engine" << parent << "\nassets " << jsonOf(setting_.plan.description).dump() << '\n';
      return;
    }
    out_ << "window host " << rectangle(setting_.plan.host.content) << '\n';
    std::size_t number = 0;
    for (const HostControl& control : setting_.plan.host.controls) {
      writeControl(control, "c" + std::to_string(number++));
    }
    out_ << "engine" << (setting_.plan.sheet ? parent : " host") << "\nadopt host\n";
  }

  void writeControl(const HostControl& control, const std::string& name) {
    const auto& row = drivers::rowOf(control.kind);
    out_ << "control " << name << ' ' << row.name << ' ' << control.tag << " in host "
         << rectangle(control.frame) << '\n';
    if (control.caption) {
      const char* const property = row.caption == Caption::title  ? ".title "
                                   : row.caption == Caption::text ? ".text "
                                                                  : ".image ";
      out_ << "set " << name << property << word(*control.caption) << '\n';
    }
    if (control.hidden) out_ << "set " << name << ".hidden YES\n";
    if (!control.enabled) out_ << "set " << name << ".enabled NO\n";
    if (control.state != toolkit::State::off) {
      out_ << "set " << name << ".state " << static_cast<int>(control.state) << '\n';
    }
    if (!control.toolTip.empty()) {
      out_ << "set " << name << ".tooltip " << word(control.toolTip) << '\n';
    }
  }

  void writeMoves() {
    out_ << "ignore log\n";
    const auto played = playPath(setting_, finding_.path);
    for (std::size_t i = 0; i < played.size(); ++i) {
      if (played[i].isEndless) {
        out_ << "ignore log\n# The next move runs lists without end: " << played[i].words << '\n';
        return;  // what the window shows then is not known
      }
      writeMove(finding_.path[i]);
      out_ << (played[i].raised ? " => raises" : "") << '\n';
    }
    writeExpectations(pictureAfter(setting_, finding_.path));
  }

  void writeMove(const Step& step) {
    if (const auto* start = std::get_if<StartMove>(&step)) {
      out_ << "load " << word(script_.filename().string()) << " from " << word(start->key)
           << (setting_.plan.sheet ? " as sheet" : "");
    } else if (const auto* press = std::get_if<PressMove>(&step)) {
      out_ << "press @" << press->control;
    } else {
      out_ << "advance " << numberWord(std::get<WaitMove>(step).seconds);
    }
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
  const Setting& setting_;
  fs::path script_;
  fs::path directory_;
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
