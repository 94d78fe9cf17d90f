// SPDX-License-Identifier: MIT
// The command `build`.
#include <algorithm>
#include <filesystem>
#include <iostream>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "qz/property_list/formats.hpp"
#include "qz/property_list/positions.hpp"
#include "tools/commands.hpp"
#include "tools/steps/po.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/steps/source_map.hpp"
#include "tools/support/folder_watch.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

// No language: shows which texts have no room to grow.
constexpr std::string_view longLanguage = "x-long";

struct BuildOptions {
  std::string source;
  std::optional<std::string> output;
  std::optional<std::string> language;
  std::optional<std::string> map;
  bool watch = false;
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

/// Returns the translations of the file LANGUAGE.po beside the source.
steps::Translate translationTo(const std::string& language, const std::string& source) {
  if (language == longLanguage) return steps::lengthened;
  const auto path = std::filesystem::path(source).replace_filename(language + ".po").string();
  const auto text = wholeFile(path);
  if (!text) {
    throw Failure(ExitStatus::badInput, path + ": cannot be read; expected the translations to " +
                                            quote(language) + " beside the source");
  }
  std::map<std::string, std::string> known;
  for (const steps::PoEntry& entry : steps::readPo(*text, path)) {
    if (!entry.isFuzzy && !entry.translation.empty()) known[entry.text] = entry.translation;
  }
  return [known](const std::string& original) -> std::optional<std::string> {
    const auto found = known.find(original);
    return found == known.end() ? std::nullopt : std::optional(found->second);
  };
}

void sayUntranslated(const steps::Source& source, const steps::Text& text,
                     const std::string& language) {
  const steps::TextUse& use = text.uses.front();
  const auto [line, column] = toolkit::TextCursor(source.text).at(use.place);
  std::cerr << source.path << ":" << line << ":" << column << ": warning: no text in "
            << quote(language) << " for " << quoteStart(text.text) << " (" << use.step << ", "
            << use.control << "); it stays as it is\n";
}

std::string outputOf(const BuildOptions& options) {
  const std::string ending = options.language ? "_" + *options.language + ".plist" : ".plist";
  auto standard = std::filesystem::path(options.source).replace_extension().concat(ending);
  return options.output.value_or(standard.string());
}

void buildSource(const BuildOptions& options) {
  if (!steps::isSourcePath(options.source)) {
    throw Failure(ExitStatus::badInput, options.source +
                                            ": expected a walk-through in steps, a file "
                                            "whose name ends with .yaml or .yml");
  }
  const auto translate =
      options.language ? translationTo(*options.language, options.source) : steps::Translate();
  const steps::ScriptFile script = steps::openScript(options.source, {}, translate);
  const std::string output = outputOf(options);
  const auto& format = toolkit::formatRow(formatFor(output));
  replaceFile(output, format.write(script.file.dictionary()));
  if (options.map) replaceFile(*options.map, steps::sourceMap(script));
  for (const steps::Text& text : script.from->source.texts) {
    if (!text.isTranslated) sayUntranslated(script.from->source, text, *options.language);
  }
}

/// Builds again whenever a file beside the source has changed, until the user interrupts. Mistakes
/// are said, and mended ones are built.
void watch(const BuildOptions& options) {
  const auto folder = std::filesystem::absolute(options.source).parent_path().string();
  watchFolder(folder, outputOf(options), [&] {
    try {
      buildSource(options);
      std::cout << outputOf(options) << ": written" << std::endl;
    } catch (const steps::SourceRefused& refused) {
      for (const std::string& message : refused.messages()) std::cerr << message << '\n';
    } catch (const Failure& failure) {
      std::cerr << failure.what() << '\n';
    }
    return true;
  });
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
  command
      .option("--language", options->language,
              "Write the script of a language, with the translations of LANG.po beside the source; "
              "x-long makes all texts longer")
      .valueName("LANG");
  command
      .option("--map", options->map,
              "Also write where in the source each list and command comes from, as JSON")
      .valueName("MAP.json")
      .path()
      .file();
  command.flag("--watch", options->watch,
               "Build again whenever a file beside the source has changed, until interrupted");
  command.action([options] {
    if (options->watch) {
      watch(*options);
    } else {
      buildSource(*options);
    }
    return static_cast<int>(ExitStatus::fine);
  });
}

}  // namespace

constexpr CommandEntry buildCommand{"build", "Make a script of a walk-through in steps",
                                    describeBuild};

}  // namespace qz::tools
