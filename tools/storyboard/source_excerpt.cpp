// SPDX-License-Identifier: MIT
#include "tools/storyboard/source_excerpt.hpp"

#include <algorithm>
#include <sstream>

#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::storyboard {
namespace {

constexpr std::size_t mostLines = 60;    // of an excerpt
constexpr std::size_t shortestGap = 4;   // lines between two of an excerpt that are left out
constexpr std::size_t widestLine = 300;  // characters

/// Adds the lines between those that are near each other.
void fillGaps(std::map<std::size_t, bool>& lines) {
  std::size_t before = 0;
  for (auto line = lines.begin(); line != lines.end(); before = line++->first) {
    if (before == 0 || line->first - before > shortestGap) continue;
    for (std::size_t number = before + 1; number < line->first; ++number) lines[number];
  }
}

}  // namespace

// A command is marked with its parameters, which may be in later lines.
void SourceExcerpts::addValue(const toolkit::ValueRef<>& value, bool isMarked, Lines& lines) const {
  const auto position = file_.positionOf(value);
  const auto* const text = position ? std::get_if<toolkit::TextPosition>(&*position) : nullptr;
  if (text) lines[file_.pathOf(value)][text->line] |= isMarked;
  const auto array = toolkit::asArray(value);
  if (!array) return;
  for (std::size_t i = 0; i < array->count(); ++i) {
    addValue(array->objectAtIndex(i), isMarked, lines);
  }
}

const std::vector<std::string>& SourceExcerpts::linesOf(const std::string& path) {
  const auto [known, isNew] = files_.try_emplace(path);
  std::istringstream source(isNew ? wholeFile(path).value_or("") : "");
  for (std::string line; std::getline(source, line);) known->second.push_back(line);
  return known->second;
}

std::vector<SourceExcerpt> SourceExcerpts::of(const std::vector<std::uint32_t>& lists) {
  Lines lines;
  for (const std::uint32_t index : lists) {
    const check::ScriptList& list = script_.lists()[index];
    addValue(list.keyValue, false, lines);
    for (const check::Element& element : list.elements) addValue(element.value, true, lines);
  }
  std::vector<SourceExcerpt> excerpts;
  for (auto& [path, marked] : lines) {
    fillGaps(marked);
    const auto& text = linesOf(path);
    SourceExcerpt& excerpt = excerpts.emplace_back(SourceExcerpt{.path = path});
    for (const auto& [number, isMarked] : marked) {
      if (number == 0 || number > text.size() || excerpt.lines.size() == mostLines) continue;
      excerpt.lines.push_back(
          {number, std::string(firstCharacters(text[number - 1], widestLine)), isMarked});
    }
  }
  return excerpts;
}

}  // namespace qz::tools::storyboard
