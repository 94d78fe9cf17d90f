// SPDX-License-Identifier: MIT
// The command `keys`.
#include <iostream>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>

#include "tools/commands.hpp"
#include "tools/play/prompt.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

/// Prints the names of the steps, one a line, in the order of the source.
void printSteps(const steps::Source& source) {
  for (const steps::Step& step : source.tour.steps) std::cout << oneLine(step.name) << '\n';
}

/// Prints the keys of the script, one a line: tags in their order, then all others.
void printKeys(const InputFile& file) {
  const auto script = file.dictionary();  // held: its entries live only as long
  std::map<std::pair<bool, toolkit::Tag>, std::set<std::string>> keys;
  for (const auto& [key, list] : script->entries()) {
    const auto text = key->description();
    const auto tag = play::parseTag(text);
    keys[{!tag, tag.value_or(0)}].insert(text);
  }
  for (const auto& [place, texts] : keys) {
    for (const std::string& text : texts) std::cout << oneLine(text) << '\n';
  }
}

void describeKeys(Command& command) {
  const auto path = std::make_shared<std::string>();
  command.argument("SCRIPT", *path, "The script, a property list; or its source, a YAML file")
      .file();
  command.task([path] {
    const steps::ScriptFile script = steps::openScript(*path);
    if (script.from) {
      printSteps(script.from->source);
    } else {
      printKeys(script.file);
    }
  });
}

}  // namespace

constexpr CommandEntry keysCommand{
    "keys", "Print the keys of a script's lists, or the names of a source's steps", describeKeys};

}  // namespace qz::tools
