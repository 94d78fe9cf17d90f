// SPDX-License-Identifier: MIT
// What is surely wrong in a script, for the commands that load one.
#pragma once

#include <iosfwd>
#include <set>
#include <string>
#include <string_view>

#include "qz/toolkit/toolkit.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools {

/// Writes a line for each error that can be read off the script, without playing it, and how to
/// learn more. Writes nothing if there is none. The toolkit's fonts and images are those that the
/// script may use. `leftOut` are codes that the caller cannot judge.
void writeReadingErrors(const InputFile& script, toolkit::Toolkit& toolkit, std::ostream& out,
                        const std::set<std::string_view>& leftOut = {});

}  // namespace qz::tools
