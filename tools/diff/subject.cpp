// SPDX-License-Identifier: MIT
#include "tools/diff/subject.hpp"

#include <algorithm>
#include <memory>

#include "tools/steps/script_file.hpp"
#include "tools/walkthrough/form_file.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::diff {
namespace {

constexpr const char* expectedContents = "a script or a window";

std::shared_ptr<const walkthrough::HostWindow> hostWindow(const std::string& path) {
  return std::make_shared<const walkthrough::HostWindow>(walkthrough::readHostWindow(path));
}

/// Whether an entry of a dictionary is a view of a window: a class and numbers. A list of commands
/// has no number.
bool describesView(const toolkit::ValueRef<>& value) {
  const auto entry = toolkit::asArray(value);
  if (entry->count() < 5 || !toolkit::asString(entry->objectAtIndex(0))) return false;
  const auto number = entry->objectAtIndex(1);
  return toolkit::asNumber(number) ||
         walkthrough::parseNumber<double>(toolkit::asString(number)->text());
}

bool isDescription(const InputFile& file) {
  const auto entries = toolkit::asDictionary(file.root())->entries();
  return !entries.empty() && std::all_of(entries.begin(), entries.end(), [](const auto& entry) {
    return describesView(entry.value);
  });
}

Subject windowSubject(const NamedFile& file, check::CheckOptions options) {
  options.stage.assets.reset();
  options.stage.window = file.readFrom;
  options.stage.host = hostWindow(file.readFrom);
  options.standIn = false;
  options.startKeys.clear();
  return {InputFile(file.path, expectedContents, "{ 0 = (); }"), std::move(options), true};
}

Subject descriptionSubject(const NamedFile& file, check::CheckOptions options) {
  options.stage.window.reset();
  options.stage.assets = file.readFrom;
  options.standIn = false;
  options.startKeys.clear();
  return {InputFile(file.path, expectedContents, "{ 0 = (); }"), std::move(options), true};
}

Subject scriptSubject(const NamedFile& file, const std::string& contents,
                      check::CheckOptions options) {
  const auto script = steps::openScriptOf(file.path, contents, options.startKeys);
  options.stage = script.stage(options.stage);
  if (options.stage.window) options.stage.host = hostWindow(*options.stage.window);
  options.standIn = !options.stage.window && !options.stage.assets;
  if (script.from) {
    auto keys = script.from->built.startKeys;
    keys.resize(std::max<std::size_t>(options.startKeys.size(), 1));
    options.startKeys = keys;
  }
  return {script.file, std::move(options), false};
}

}  // namespace

Subject openSubject(const NamedFile& file, const check::CheckOptions& options) {
  if (walkthrough::namesForm(file.path)) return windowSubject(file, options);
  const std::string contents = requireContents(file.readFrom, expectedContents);
  if (steps::isSourcePath(file.path)) return scriptSubject(file, contents, options);
  const InputFile list(file.path, expectedContents, contents);
  if (toolkit::asArray(list.root())) return windowSubject(file, options);
  if (isDescription(list)) return descriptionSubject(file, options);
  return scriptSubject(file, contents, options);
}

}  // namespace qz::tools::diff
