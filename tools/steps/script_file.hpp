// SPDX-License-Identifier: MIT
// Opens what a command plays or checks: a script, or the source of one.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/steps/compiler.hpp"
#include "tools/steps/source.hpp"
#include "tools/support/input_file.hpp"
#include "tools/walkthrough/names.hpp"

namespace qz::tools::steps {

/// A script that was built of a source.
struct BuiltSource {
  Source source{};
  Built built{};
};

/// A script as a file, or built in memory.
struct ScriptFile {
  InputFile file;                   ///< the script; its positions are those of the source
  std::optional<BuiltSource> from;  ///< absent for a script that is a file

  /// Returns the names of the source; none for a script that is a file.
  walkthrough::Names names() const;
  /// Returns what the script is played on: the window of the options, else that of the source.
  walkthrough::StageOptions stage(walkthrough::StageOptions options) const;
};

/// Reads the script at `path`, or builds it if this is a source. The first start keys of a built
/// script are those of the steps `starts`, or else of the first step. Throws a SourceRefused if the
/// source has mistakes, another Failure if a file cannot be read or does not hold what it should.
ScriptFile openScript(const std::string& path, const std::vector<std::string>& starts = {},
                      const Translate& translate = {});

/// The same, with contents that the file at `path` had once. What a source names is beside `path`.
ScriptFile openScriptOf(const std::string& path, const std::string& contents,
                        const std::vector<std::string>& starts = {});

/// Reads any property list; of a source, the script that is built of it.
InputFile openPropertyList(const std::string& path);

}  // namespace qz::tools::steps
