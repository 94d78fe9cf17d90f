// SPDX-License-Identifier: MIT
#include "tools/stage_arguments.hpp"

#include "tools/check/report.hpp"
#include "tools/support/drivers.hpp"

namespace qz::tools {

WindowArguments addStageOptions(Command& command, walkthrough::StageOptions& stage,
                                std::optional<std::string>& resources) {
  auto window =
      command.option("--window", stage.window,
                     "The host's window, a property list of its controls or a form (.ui)");
  auto assets = command.option("--assets", stage.assets,
                               "A description from which the engine builds the window");
  window.valueName("HOST.plist").file().excludes(assets);
  assets.valueName("DESCRIPTION.plist").file();
  command.option("--resources", resources, "The directory of the images (default: the script's)")
      .valueName("DIR")
      .directory();
  command.flag("--sheet", stage.sheet,
               "Show the window as a sheet over another window of the host");
  return {window, assets};
}

std::string playStageArguments(const walkthrough::StageOptions& stage,
                               const std::optional<std::string>& resources) {
  std::string arguments;
  const auto add = [&](const char* option, const std::optional<std::string>& value) {
    if (value) arguments += std::string(" ") + option + " " + check::shellWord(*value);
  };
  add("--window", stage.window);
  add("--assets", stage.assets);
  add("--resources", resources);
  if (stage.sheet) arguments += " --sheet";
  return arguments;
}

void addToolkitOption(Command& command, std::string& toolkit, const std::string& help) {
  command.option("--toolkit", toolkit, help + ": " + toolkitHelp())
      .valueName("NAME")
      .choices(driverNames())
      .showDefault();
}

}  // namespace qz::tools
