// SPDX-License-Identifier: MIT
// The command `dump`.
#include <iostream>
#include <memory>
#include <string>

#include "qz/property_list/canonical_dump.hpp"
#include "tools/commands.hpp"
#include "tools/readable_dump.hpp"
#include "tools/shared_values.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/terminal.hpp"

namespace qz::tools {
namespace {

struct DumpOptions {
  std::string file;
  bool canonical = false;
  bool dictionary = false;
};

void dump(const DumpOptions& options) {
  const InputFile file = steps::openPropertyList(options.file);
  if (options.dictionary) file.dictionary();
  requireWritableInFull(file);
  if (options.canonical) {
    std::cout << toolkit::canonicalDump(*file.root()) << '\n';
  } else {
    writeReadableDump(*file.root(), std::cout, outputShowsColor());
  }
}

void describeDump(Command& command) {
  const auto options = std::make_shared<DumpOptions>();
  command
      .argument("FILE", options->file,
                "The property list; or a source, for the script that is built of it")
      .file();
  command.flag("--canonical", options->canonical,
               "Print one line of ASCII that is the same for equal values");
  command.flag("--dictionary", options->dictionary, "Fail unless the root is a dictionary");
  command.task([options] { dump(*options); });
}

}  // namespace

constexpr CommandEntry dumpCommand{"dump", "Print a property list of any format", describeDump};

}  // namespace qz::tools
