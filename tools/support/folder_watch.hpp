// SPDX-License-Identifier: MIT
// Waits for changes of the files in a folder.
#pragma once

#include <functional>
#include <string>

namespace qz::tools {

/// Calls `act`, and calls it again whenever a file in the folder was written, made or removed since
/// the call before; until `act` answers NO. What `act` itself writes to `output` is no such change.
/// Looks five times a second.
void watchFolder(const std::string& folder, const std::string& output,
                 const std::function<bool()>& act);

}  // namespace qz::tools
