// SPDX-License-Identifier: MIT
// The scripts of the repository with their windows, for tests that play them.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "tests/check/script_reading.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive {

struct StagedScript {
  Script script;
  tools::walkthrough::HostWindow host;
  std::string resources;  ///< the directory of the images
};

/// Returns the paths of the scripts in a folder and below, sorted. A property list whose root is no
/// dictionary is not a script, nor is a description of a window, `assets.plist`.
std::vector<std::filesystem::path> scriptFilesIn(const std::filesystem::path& folder);

/// Returns the scripts of the examples in the repository at `root`: those that are written by hand,
/// and those that two examples in steps had before.
std::vector<std::filesystem::path> exampleScripts(const std::filesystem::path& root);

/// Reads a script. Its window is `window.plist`, `NAME-host.plist` or `host.plist` in the same
/// folder (NAME is that of the script without the language of a translation), or one like that
/// which the engine builds from `assets.plist`, or else one made from the script itself. A script
/// in a folder `scripts` has the window of the example of its name. Throws a tools::Failure if a
/// file does not hold what it should.
StagedScript stagedScript(const std::filesystem::path& file);

}  // namespace qz::naive
