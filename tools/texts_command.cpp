// SPDX-License-Identifier: MIT
// The command `texts`.
#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>

#include "tools/commands.hpp"
#include "tools/steps/pictures.hpp"
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
  std::optional<std::string> screenshots;
};

namespace fs = std::filesystem;

/// The pictures of the steps, by their names.
using Pictures = std::map<std::string, std::string>;

/// Returns a path as it is seen from the directory of `file`.
std::string seenFrom(const std::string& file, const std::string& path) {
  const auto folder = fs::absolute(file).parent_path();
  return fs::absolute(path).lexically_proximate(folder).generic_string();
}

std::string commentOf(const steps::Source& source, const steps::TextUse& use,
                      const Pictures& pictures) {
  const bool isOfAll = use.step == "every step";
  const std::string comment =
      (isOfAll ? use.step : "step " + use.step) + ": " + use.property + " of " + use.control;
  const auto picture = pictures.find(isOfAll ? source.tour.steps.front().name : use.step);
  return picture == pictures.end() ? comment : comment + ", in " + picture->second;
}

steps::PoEntry entryOf(const steps::Source& source, const steps::Text& text,
                       const Pictures& pictures) {
  steps::PoEntry entry{.text = text.text};
  for (const steps::TextUse& use : text.uses) {
    const steps::FilePlace place = source.files.at(use.place);
    entry.comments.push_back(commentOf(source, use, pictures));
    entry.references.push_back(seenFrom(source.path, place.path) + ":" +
                               std::to_string(place.line));
  }
  return entry;
}

void extract(const TextsOptions& options) {
  const steps::Source source = steps::readSource(options.source);
  const fs::path path = options.source;
  const std::string output =
      options.output.value_or(fs::path(path).replace_extension(".pot").string());
  Pictures pictures;
  if (options.screenshots) pictures = steps::writePictures(source, *options.screenshots);
  for (auto& [step, picture] : pictures) picture = seenFrom(output, picture);
  std::vector<steps::PoEntry> entries;
  for (const steps::Text& text : source.texts) entries.push_back(entryOf(source, text, pictures));
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
  command
      .option("--screenshots", options->screenshots,
              "Write a picture of every step to this directory, and name it at the step's texts")
      .valueName("DIR")
      .directory();
  command.task([options] {
    if (options->action != "extract") {
      throw UsageError("expected the action “extract”, found " + quote(options->action));
    }
    extract(*options);
  });
}

}  // namespace

constexpr CommandEntry textsCommand{"texts", "Collect the texts of a source for translators",
                                    describeTexts};

}  // namespace qz::tools
