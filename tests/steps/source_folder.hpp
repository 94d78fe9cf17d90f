// SPDX-License-Identifier: MIT
// A directory with a host's window, for the tests of sources.
#pragma once

#include <string>

#include "tests/tools/play_files.hpp"
#include "tools/steps/script_file.hpp"

namespace qz::tools::steps {

/// Sources in it can have the controls that `head` names.
class SourceFolder : public play::WorkingDirectory {
 public:
  SourceFolder() {
    write("host.plist", R"((
      { class = NSTextField; tag = 1; frame = (10, 90, 300, 30); title = "Text"; },
      { class = NSImageView; tag = 2; frame = (10, 90, 30, 30); },
      { class = "NSButton:toggle"; tag = 3; frame = (10, 50, 300, 30); title = "Box"; },
      { class = NSButton; tag = 4; frame = (10, 10, 90, 30); title = "Next"; },
      { class = NSButton; tag = 5; frame = (110, 10, 90, 30); title = "Back"; },
      { class = NSBox; tag = 6; frame = (0, 0, 300, 300); }
    ))");
  }

  /// The first two lines of a source; what follows begins in line 3.
  static constexpr const char* head =
      "window: host.plist\n"
      "controls: {text: 1, picture: 2, box: 3, next: 4, back: 5, frame: 6}\n";

  /// Writes a source that begins with `head` to tour.yaml.
  void writeSource(const std::string& rest) const { write("tour.yaml", head + rest); }
  ScriptFile open(const std::string& rest) const {
    writeSource(rest);
    return openScript("tour.yaml");
  }
};

}  // namespace qz::tools::steps
