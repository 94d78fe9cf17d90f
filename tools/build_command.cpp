// SPDX-License-Identifier: MIT
// The command `build`.
#include <algorithm>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/property_list/formats.hpp"
#include "tools/commands.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/replace_file.hpp"

namespace qz::tools {
namespace {

struct BuildOptions {
  std::string source;
  std::optional<std::string> output;
};

toolkit::Format formatFor(const std::string& path) {
  for (const toolkit::FormatRow& row : toolkit::formats()) {
    const bool isNamed =
        std::any_of(row.suffixes.begin(), row.suffixes.end(),
                    [&](std::string_view suffix) { return path.ends_with(suffix); });
    if (row.write && isNamed) return row.format;
  }
  return toolkit::Format::xml;
}

void buildSource(const BuildOptions& options) {
  if (!steps::isSourcePath(options.source)) {
    throw Failure(ExitStatus::badInput, options.source +
                                            ": expected a walk-through in steps, a file "
                                            "whose name ends with .yaml or .yml");
  }
  const steps::ScriptFile script = steps::openScript(options.source);
  const std::string output = options.output.value_or(
      std::filesystem::path(options.source).replace_extension(".plist").string());
  const auto& format = toolkit::formatRow(formatFor(output));
  replaceFile(output, format.write(script.file.dictionary()));
}

void describeBuild(Command& command) {
  const auto options = std::make_shared<BuildOptions>();
  command.argument("SOURCE", options->source, "The walk-through in steps, a YAML file").file();
  command
      .option("-o,--output", options->output,
              "The script to write (default: the source's name with .plist)")
      .valueName("SCRIPT.plist")
      .path()
      .file();
  command.action([options] {
    buildSource(*options);
    return static_cast<int>(ExitStatus::fine);
  });
}

}  // namespace

constexpr CommandEntry buildCommand{"build", "Make a script of a walk-through in steps",
                                    describeBuild};

}  // namespace qz::tools
