// SPDX-License-Identifier: MIT
// The command `build`.
#include <iostream>
#include <memory>
#include <string>
#include <vector>

#include "qz/property_list/formats.hpp"
#include "tools/commands.hpp"
#include "tools/steps/compiler.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/replace_file.hpp"

namespace qz::tools {
namespace {

struct BuildOptions {
  std::string source;
  std::string output;
};

void buildSource(const BuildOptions& options) {
  const steps::Source source = steps::readSource(options.source);
  steps::Mistakes mistakes;
  const steps::Built built = steps::build(source.tour, {0}, mistakes);
  mistakes.throwIfAny(source.path, source.text);
  replaceFile(options.output, toolkit::formatRow(toolkit::Format::xml).write(built.script));
}

void describeBuild(Command& command) {
  const auto options = std::make_shared<BuildOptions>();
  command.argument("SOURCE", options->source, "The walk-through in steps, a YAML file").file();
  command.argument("OUT", options->output, "The script to write").path().file();
  command.action([options] {
    try {
      buildSource(*options);
    } catch (const steps::SourceRefused& refused) {
      for (const std::string& message : refused.messages()) std::cerr << message << '\n';
      return static_cast<int>(ExitStatus::badInput);
    }
    return static_cast<int>(ExitStatus::fine);
  });
}

}  // namespace

constexpr CommandEntry buildCommand{"build", "Make a script of a walk-through in steps",
                                    describeBuild};

}  // namespace qz::tools
