// SPDX-License-Identifier: MIT
// Waits for changes of the files in folders.
#pragma once

#include <functional>
#include <set>
#include <string>

namespace qz::tools {

/// Calls `act`, and calls it again whenever a file in the folders was written, made or removed
/// since the call before. `act` returns the folders to watch from then on; none ends this. The
/// files `outputs`, which `act` itself writes, are not watched. `rest` passes the time between two
/// looks, and returns whether to look again; NO ends this.
void watchFolders(std::set<std::string> folders, const std::set<std::string>& outputs,
                  const std::function<std::set<std::string>()>& act,
                  const std::function<bool()>& rest);

}  // namespace qz::tools
