// SPDX-License-Identifier: MIT
#include "tools/check/lines.hpp"

#include <sstream>

#include "tools/support/failure.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {

std::vector<Line> linesOf(const std::string& path, std::string_view what) {
  const auto contents = wholeFile(path);
  if (!contents) {
    throw Failure(ExitStatus::badInput,
                  path + ": cannot be read; expected a file of " + std::string(what));
  }
  std::vector<Line> lines;
  std::istringstream text(*contents);
  std::size_t number = 0;
  for (std::string line; std::getline(text, line);) {
    Line found{.number = ++number, .words = {}};
    std::istringstream words(line);
    for (std::string word; words >> word && !word.starts_with('#');) found.words.push_back(word);
    if (!found.words.empty()) lines.push_back(std::move(found));
  }
  return lines;
}

}  // namespace qz::tools::check
