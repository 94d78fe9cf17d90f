// SPDX-License-Identifier: MIT
// The source of a walk-through: a YAML file, and those that it includes.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/steps/parts.hpp"
#include "tools/steps/source_files.hpp"
#include "tools/steps/texts.hpp"
#include "tools/steps/tour.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::steps {

struct Source {
  std::string path{};
  SourceFiles files{};
  walkthrough::StageOptions stage{};  ///< the window that the source names
  Tour tour{};
  std::vector<Text> texts{};  ///< for translators, in the order of the file
};

/// Whether the file's name is that of a source: it ends with .yaml or .yml.
bool isSourcePath(const std::string& path);

/// Returns the controls of a window as its host made it, back to front. `resources` is the
/// directory of the images.
std::vector<Control> controlsOf(const walkthrough::StagePlan& plan, const std::string& resources);

/// Returns the controls of the window that the options name, back to front.
using ReadControls = std::function<std::vector<Control>(const walkthrough::StageOptions&)>;

/// What a source names.
struct SourceInputs {
  ReadControls readControls;
  ReadText readText;  ///< of included files
};

/// Reads a source from its text. Throws a SourceRefused if there are mistakes in it.
Source readSourceText(const std::string& path, std::string text, const SourceInputs& inputs,
                      const Translate& translate = {});

/// Reads a source, and the window that it names. With `translate` its texts are in another
/// language. Throws a SourceRefused if there are mistakes in it, another Failure if a file cannot
/// be read.
Source readSource(const std::string& path, const Translate& translate = {});

/// The same, with the text that the source at `path` had once.
Source readSourceOf(const std::string& path, const std::string& text,
                    const Translate& translate = {});

}  // namespace qz::tools::steps
