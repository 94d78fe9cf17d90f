// SPDX-License-Identifier: MIT
// Two scripts of the tests, and what diff says of them.
#pragma once

#include <nlohmann/json.hpp>

#include <memory>
#include <sstream>
#include <string>

#include "tests/check/script_reading.hpp"
#include "tools/diff/report.hpp"
#include "tools/support/drivers.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::tools::diff {

/// A script in a window.
struct Staged {
  naive::Script script;
  walkthrough::HostWindow host;
};

inline Subject subjectOf(const Staged& staged, const std::string& name,
                         const std::string& resources) {
  check::CheckOptions options;
  options.stage.window = "host.plist";
  options.stage.host = std::make_shared<const walkthrough::HostWindow>(staged.host);
  options.resources = resources;
  options.toolkit = testToolkit();
  return {InputFile(name, "a script", staged.script, {}), options, false};
}

class DiffedScripts {
 public:
  DiffedScripts(const Staged& before, const Staged& after, const std::string& resources = ".")
      : subjects_{subjectOf(before, "old.plist", resources),
                  subjectOf(after, "new.plist", resources)},
        diff_(compareSubjects(subjects_, {})) {}

  const Diff& diff() const { return *diff_; }
  const std::vector<Change>& changes() const { return diff_->changes; }

  std::string text() const { return written(writeText); }
  nlohmann::json json() const { return nlohmann::json::parse(written(writeJson)); }

 private:
  std::string written(void (*write)(const Report&, bool, std::ostream&)) const {
    std::ostringstream out;
    write({subjects_, *diff_, {"play old", "play new"}, {"old.plist", "new.plist"}}, false, out);
    return out.str();
  }

  Both<Subject> subjects_;
  std::unique_ptr<Diff> diff_;
};

}  // namespace qz::tools::diff
