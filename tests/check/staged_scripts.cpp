// SPDX-License-Identifier: MIT
// Reads scripts with their windows.
#include "tests/check/staged_scripts.hpp"

#include <algorithm>
#include <optional>
#include <string>

#include "drivers/memory/memory_driver.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::naive {

namespace {

// Returns the name without the language of a translation, such as the "_de" of "tour_de.plist".
std::string originalOf(const std::filesystem::path& file) {
  const std::string name = file.stem().string();
  const bool isTranslation = name.size() > 3 && name[name.size() - 3] == '_';
  return isTranslation ? name.substr(0, name.size() - 3) : name;
}

using tools::walkthrough::HostControl;
using tools::walkthrough::HostWindow;

constexpr const char* descriptionName = "assets.plist";

bool isScriptFile(const std::filesystem::path& file) {
  if (file.extension() != ".plist" || file.filename() == descriptionName) return false;
  return static_cast<bool>(
      toolkit::asDictionary(tools::InputFile(file.string(), "a property list").root()));
}

HostControl controlOf(const drivers::ViewPicture& picture) {
  HostControl control;
  control.kind = picture.kind;
  control.tag = picture.tag;
  control.frame = picture.frame;
  control.hidden = picture.hidden;
  control.enabled = picture.enabled;
  control.state = picture.state;
  control.toolTip = picture.toolTip;
  const auto caption = rowOf(picture.kind).caption;
  if (caption == drivers::Caption::title) control.caption = picture.title.string();
  if (caption == drivers::Caption::text) control.caption = picture.text.string();
  if (caption == drivers::Caption::imageName) control.caption = picture.image;
  return control;
}

/// Returns a host's window with the same controls as the one that the engine builds.
HostWindow builtWindow(const tools::walkthrough::StagePlan& plan) {
  drivers::MemoryDriver driver;
  tools::walkthrough::Stage stage(driver, plan);
  HostWindow host;
  const auto window = stage.engine().tutorialWindow();
  host.content = driver.look(window).content;
  for (const auto& view : window->contentView()->subviews()) {
    host.controls.push_back(controlOf(driver.look(view)));
  }
  return host;
}

std::optional<std::string> existing(const std::filesystem::path& file) {
  return std::filesystem::exists(file) ? std::optional(file.string()) : std::nullopt;
}

/// Returns the folder of a script's window and images: its own, or that of the example that is
/// written in steps and does what the script does.
std::filesystem::path stageFolderOf(const std::filesystem::path& file) {
  const auto folder = file.parent_path();
  const auto example = folder / "../../../examples" / file.stem();
  return folder.filename() == "scripts" ? example : folder;
}

}  // namespace

std::vector<std::filesystem::path> scriptFilesIn(const std::filesystem::path& folder) {
  std::vector<std::filesystem::path> files;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
    if (entry.is_regular_file() && isScriptFile(entry.path())) files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

std::vector<std::filesystem::path> exampleScripts(const std::filesystem::path& root) {
  auto files = scriptFilesIn(root / "examples");
  const auto more = scriptFilesIn(root / "tests/data/scripts");
  files.insert(files.end(), more.begin(), more.end());
  return files;
}

StagedScript stagedScript(const std::filesystem::path& file) {
  const auto folder = stageFolderOf(file);
  tools::walkthrough::StageOptions options;
  options.window = existing(folder / "window.plist");
  if (!options.window) options.window = existing(folder / (originalOf(file) + "-host.plist"));
  if (!options.window) options.window = existing(folder / "host.plist");
  if (!options.window) options.assets = existing(folder / descriptionName);
  StagedScript staged;
  staged.script = tools::InputFile(file.string(), "a script").dictionary();
  staged.resources = folder.string();
  const auto plan = planStage(options, staged.script, file.string());
  staged.host = plan.description ? builtWindow(plan) : plan.host;
  return staged;
}

}  // namespace qz::naive
