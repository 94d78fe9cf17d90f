// SPDX-License-Identifier: MIT
// The command `texts`.
#include <filesystem>
#include <memory>
#include <optional>
#include <string>

#include "qz/property_list/positions.hpp"
#include "tools/commands.hpp"
#include "tools/steps/po.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

struct TextsOptions {
  std::string action;
  std::string source;
  std::optional<std::string> output;
};

steps::PoEntry entryOf(const steps::Source& source, const steps::Text& text) {
  steps::PoEntry entry{.text = text.text};
  const std::string file = std::filesystem::path(source.path).filename().string();
  for (const steps::TextUse& use : text.uses) {
    const auto [line, column] = toolkit::TextCursor(source.text).at(use.place);
    const std::string comment = (use.step == "every step" ? use.step : "step " + use.step) + ": " +
                                use.property + " of " + use.control;
    entry.comments.push_back(comment);
    entry.references.push_back(file + ":" + std::to_string(line));
  }
  return entry;
}

void extract(const TextsOptions& options) {
  const steps::Source source = steps::readSource(options.source);
  std::vector<steps::PoEntry> entries;
  for (const steps::Text& text : source.texts) entries.push_back(entryOf(source, text));
  const auto path = std::filesystem::path(options.source);
  const std::string output =
      options.output.value_or(std::filesystem::path(path).replace_extension(".pot").string());
  replaceFile(output, steps::writePoTemplate(entries, path.stem().string()));
}

void describeTexts(Command& command) {
  const auto options = std::make_shared<TextsOptions>();
  command.argument("ACTION", options->action, "extract: write the texts for translators")
      .choices({"extract"});
  command.argument("SOURCE", options->source, "The walk-through in steps, a YAML file").file();
  command
      .option("-o,--output", options->output,
              "The template to write (default: the source's name with .pot)")
      .valueName("TEXTS.pot")
      .path()
      .file();
  command.action([options] {
    if (options->action != "extract") {
      throw UsageError("expected the action “extract”, found " + quote(options->action));
    }
    extract(*options);
    return static_cast<int>(ExitStatus::fine);
  });
}

}  // namespace

constexpr CommandEntry textsCommand{"texts", "Collect the texts of a source for translators",
                                    describeTexts};

}  // namespace qz::tools
