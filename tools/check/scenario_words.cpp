// SPDX-License-Identifier: MIT
#include "tools/check/scenario_words.hpp"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <set>

#include "qz/property_list/scalars.hpp"

namespace qz::tools::check {
namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;
using drivers::Caption;
using walkthrough::HostControl;

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

class SetUp {
 public:
  SetUp(const WrittenPlay& play, const std::vector<std::string>& names, std::ostream& out)
      : play_(play), names_(names), out_(out) {}

  void write() {
    writeFiles();
    writeWindow();
  }

 private:
  void writeFiles() {
    writeCopy(play_.script);
    for (const fs::path& image : imagesOf(play_.setting.script, play_.setting.resources)) {
      if (image.filename() != play_.script.filename()) writeCopy(image);
    }
  }

  void writeCopy(const fs::path& file) {
    const auto path = fs::absolute(file).lexically_proximate(fs::absolute(play_.directory));
    out_ << "copy " << quotedWord(file.filename().string()) << ' '
         << quotedWord(path.generic_string()) << '\n';
  }

  void writeWindow() {
    const auto& plan = play_.setting.plan;
    if (plan.sheet) out_ << "window parent\n";
    const std::string parent = plan.sheet ? " parent" : "";
    if (plan.description) {
      out_ << "engine" << parent << "\nassets " << jsonOf(plan.description).dump() << '\n';
      return;
    }
    out_ << "window host " << rectangle(plan.host.content) << '\n';
    std::size_t number = 0;
    for (const HostControl& control : plan.host.controls) writeControl(control, names_[number++]);
    out_ << "engine" << (plan.sheet ? parent : " host") << "\nadopt host\n";
  }

  void writeControl(const HostControl& control, const std::string& name) {
    const auto& row = drivers::rowOf(control.kind);
    out_ << "control " << name << ' ' << row.name << ' ' << control.tag << " in host "
         << rectangle(control.frame) << '\n';
    if (control.caption) {
      const char* const property = row.caption == Caption::title  ? ".title "
                                   : row.caption == Caption::text ? ".text "
                                                                  : ".image ";
      out_ << "set " << name << property << quotedWord(*control.caption) << '\n';
    }
    if (control.hidden) out_ << "set " << name << ".hidden YES\n";
    if (!control.enabled) out_ << "set " << name << ".enabled NO\n";
    if (control.state != toolkit::State::off) {
      out_ << "set " << name << ".state " << static_cast<int>(control.state) << '\n';
    }
    if (!control.toolTip.empty()) {
      out_ << "set " << name << ".tooltip " << quotedWord(control.toolTip) << '\n';
    }
  }

  const WrittenPlay& play_;
  const std::vector<std::string>& names_;
  std::ostream& out_;
};

}  // namespace

std::string quotedWord(const std::string& text) {
  return Json(text).dump(-1, ' ', false, Json::error_handler_t::replace);
}

std::string yesNo(bool value) { return value ? "YES" : "NO"; }

std::string numberWord(double value) { return Json(value).dump(); }

void writeSetUp(const WrittenPlay& play, const std::vector<std::string>& names, std::ostream& out) {
  SetUp(play, names, out).write();
}

void writeMove(const WrittenPlay& play, const Step& step, const std::string& pressed,
               std::ostream& out) {
  if (const auto* start = std::get_if<StartMove>(&step)) {
    out << "load " << quotedWord(play.script.filename().string()) << " from "
        << quotedWord(start->key) << (play.setting.plan.sheet ? " as sheet" : "");
  } else if (std::holds_alternative<PressMove>(step)) {
    out << "press " << pressed;
  } else {
    out << "advance " << numberWord(std::get<WaitMove>(step).seconds);
  }
}

}  // namespace qz::tools::check
