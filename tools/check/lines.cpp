// SPDX-License-Identifier: MIT
#include "tools/check/lines.hpp"

#include <algorithm>
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

void skipBlanks(std::string_view& line) {
  line.remove_prefix(std::min(line.find_first_not_of(blanks), line.size()));
}

/// Says in which column of a line a byte is. The bytes must come in their order.
class Columns {
 public:
  explicit Columns(std::string_view line) : line_(line) {}

  std::size_t at(std::size_t byte) {
    const auto passed = line_.substr(byte_, byte - byte_);
    column_ += static_cast<std::size_t>(
        std::count_if(passed.begin(), passed.end(), [](char c) { return (c & 0xC0) != 0x80; }));
    byte_ = byte;
    return column_;
  }

 private:
  std::string_view line_;
  std::size_t byte_ = 0;
  std::size_t column_ = 1;
};

Line lineOf(std::size_t number, std::string_view text) {
  Line line{.number = number, .text = {}, .words = {}, .columns = {}};
  Columns columns(text);
  std::string_view rest = text;
  skipBlanks(rest);
  const std::size_t begin = text.size() - rest.size();
  std::size_t end = begin;  // of the last word
  while (!rest.empty() && rest.front() != '#') {
    line.columns.push_back(columns.at(text.size() - rest.size()));
    line.words.push_back(takeWord(rest));
    end = text.size() - rest.size();
    skipBlanks(rest);
  }
  line.columns.push_back(columns.at(end));
  line.text = text.substr(begin, end - begin);
  return line;
}

std::string textOf(const std::string& path, std::string_view what) {
  if (auto contents = wholeFile(path)) return *std::move(contents);
  throw Failure(ExitStatus::badInput,
                path + ": cannot be read; expected a file of " + std::string(what));
}

}  // namespace

std::vector<Line> linesOf(const std::string& path, std::string_view what) {
  std::vector<Line> lines;
  std::istringstream text(textOf(path, what));
  std::size_t number = 0;
  for (std::string line; std::getline(text, line);) {
    Line found = lineOf(++number, line);
    if (!found.words.empty()) lines.push_back(std::move(found));
  }
  return lines;
}

}  // namespace qz::tools::check
