// SPDX-License-Identifier: MIT
// Opens scripts and sources alike.
#include "tools/steps/script_file.hpp"

#include <algorithm>

#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

constexpr const char* expectedFile = "a script";

StepIndex stepNamed(const Source& source, const std::string& name) {
  std::vector<std::string_view> names;
  for (StepIndex i = 0; i < source.tour.steps.size(); ++i) {
    if (source.tour.steps[i].name == name) return i;
    names.push_back(source.tour.steps[i].name);
  }
  throw Failure(ExitStatus::failed,
                source.path + ": no step is called " + quote(name) + didYouMean(name, names));
}

/// Returns the steps to start at. The first step is always one, so that the same steps are reached.
std::vector<StepIndex> startsOf(const Source& source, const std::vector<std::string>& names) {
  std::vector<StepIndex> starts;
  starts.reserve(names.size() + 1);
  for (const std::string& name : names) starts.push_back(stepNamed(source, name));
  if (std::find(starts.begin(), starts.end(), StepIndex{0}) == starts.end()) starts.push_back(0);
  return starts;
}

ScriptFile built(Source source, const std::vector<std::string>& starts) {
  BuiltSource from{.source = std::move(source), .built = {}};
  Mistakes mistakes;
  from.built = build(from.source.tour, startsOf(from.source, starts), mistakes);
  mistakes.throwIfAny(from.source.files);
  InputFile file(from.source.path, expectedFile, from.built.script,
                 from.source.files.written(from.built.offsets));
  return {std::move(file), std::move(from)};
}

}  // namespace

walkthrough::Names ScriptFile::names() const {
  walkthrough::Names names;
  if (!from) return names;
  const Tour& tour = from->source.tour;
  for (const auto& [tag, control] : from->built.controlOfTag) {
    if (!tour.controls[control].name.empty()) names.controls[tag] = tour.controls[control].name;
  }
  for (const auto& [key, step] : from->built.stepOfKey) names.steps[key] = tour.steps[step].name;
  return names;
}

walkthrough::StageOptions ScriptFile::stage(walkthrough::StageOptions options) const {
  if (!from) return options;
  if (!options.window && !options.assets) {
    options.window = from->source.stage.window;
    options.assets = from->source.stage.assets;
  }
  options.names = names();
  return options;
}

ScriptFile openScript(const std::string& path, const std::vector<std::string>& starts,
                      const Translate& translate) {
  if (!isSourcePath(path)) return {InputFile(path, expectedFile), std::nullopt};
  return built(readSource(path, translate), starts);
}

ScriptFile openScriptOf(const std::string& path, const std::string& contents,
                        const std::vector<std::string>& starts) {
  if (!isSourcePath(path)) return {InputFile(path, expectedFile, contents), std::nullopt};
  return built(readSourceOf(path, contents), starts);
}

InputFile openPropertyList(const std::string& path) {
  if (isSourcePath(path)) return openScript(path).file;
  return {path, "a property list", ExitStatus::failed};
}

}  // namespace qz::tools::steps
