// SPDX-License-Identifier: MIT
// The exported command names, by the names of their constants.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace qz::tools::scenario {

/// Returns the constants' names, in the order of the catalogue.
std::vector<std::string_view> commandConstants();

/// Renames commands, and restores their names on destruction.
class RenamedCommands {
 public:
  RenamedCommands() = default;
  ~RenamedCommands();
  RenamedCommands(const RenamedCommands&) = delete;
  RenamedCommands& operator=(const RenamedCommands&) = delete;

  /// `constant` must be one of `commandConstants`.
  void rename(std::string_view constant, std::string name);

 private:
  std::vector<std::pair<std::string*, std::string>> before_;
};

}  // namespace qz::tools::scenario
