// SPDX-License-Identifier: MIT
// The parts of a script that made a step.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "tools/exploration/script.hpp"
#include "tools/storyboard/page.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::storyboard {

class SourceExcerpts {
 public:
  /// The arguments must outlive it.
  SourceExcerpts(const InputFile& file, const check::Script& script)
      : file_(file), script_(script) {}

  /// Returns the lines of the lists, with the commands marked: one excerpt for each file. There is
  /// none of a binary file.
  std::vector<SourceExcerpt> of(const std::vector<std::uint32_t>& lists);

 private:
  /// Lines of files, by the files' paths; whether they are marked.
  using Lines = std::map<std::string, std::map<std::size_t, bool>>;

  void addValue(const toolkit::ValueRef<>& value, bool isMarked, Lines& lines) const;
  const std::vector<std::string>& linesOf(const std::string& path);

  const InputFile& file_;
  const check::Script& script_;
  std::map<std::string, std::vector<std::string>> files_;
};

}  // namespace qz::tools::storyboard
