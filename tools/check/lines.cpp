// SPDX-License-Identifier: MIT
#include "tools/check/lines.hpp"

#include <sstream>

#include "tools/support/failure.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

constexpr std::string_view blanks = " \t\r";

/// Takes the first word off a line, without the quotes around it or in it.
std::string takeWord(std::string_view& line) {
  if (line.front() == ',') {
    line.remove_prefix(1);
    return ",";
  }
  std::string word;
  bool isQuoted = false;
  while (!line.empty()) {
    const char c = line.front();
    if (!isQuoted && (c == ',' || blanks.find(c) != std::string_view::npos)) break;
    if (c == '"') {
      isQuoted = !isQuoted;
    } else {
      word += c;
    }
    line.remove_prefix(1);
  }
  return word;
}

std::vector<std::string> wordsOf(std::string_view line) {
  std::vector<std::string> words;
  while (true) {
    line.remove_prefix(std::min(line.find_first_not_of(blanks), line.size()));
    if (line.empty() || line.front() == '#') return words;
    words.push_back(takeWord(line));
  }
}

}  // namespace

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
    Line found{.number = ++number, .text = line, .words = wordsOf(line)};
    if (!found.words.empty()) lines.push_back(std::move(found));
  }
  return lines;
}

}  // namespace qz::tools::check
