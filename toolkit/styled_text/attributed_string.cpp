// SPDX-License-Identifier: MIT
// Every change uses `push`, which keeps the invariants of the runs: it drops empty runs and extends
// the last run instead of adding an equal neighbour.
#include "qz/styled_text/attributed_string.hpp"

#include <algorithm>
#include <utility>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {
namespace {

void push(std::vector<TextRun>& runs, TextRange range, const TextAttributes& attributes) {
  if (range.length == 0) return;
  if (!runs.empty() && runs.back().attributes == attributes) {
    runs.back().range.length += range.length;
  } else {
    runs.push_back({range, attributes});
  }
}

std::size_t end(TextRange range) { return range.location + range.length; }

void requireRange(TextRange range, std::size_t length) {
  if (range.location <= length && range.length <= length - range.location) return;
  throw RangeException("-[NSMutableAttributedString addAttribute:value:range:]: range {" +
                       std::to_string(range.location) + ", " + std::to_string(range.length) +
                       "} out of bounds; text length " + std::to_string(length));
}

/// Returns `runs` with the attribute at `member` set to `value` over `range`, which must lie within
/// the text.
template <class Attribute>
std::vector<TextRun> withAttribute(const std::vector<TextRun>& runs,
                                   std::optional<Attribute> TextAttributes::*member,
                                   const std::optional<Attribute>& value, TextRange range) {
  std::vector<TextRun> result;
  result.reserve(runs.size() + 2);
  for (const TextRun& run : runs) {
    const std::size_t from = std::clamp(range.location, run.range.location, end(run.range));
    const std::size_t to = std::clamp(end(range), from, end(run.range));
    push(result, {run.range.location, from - run.range.location}, run.attributes);
    if (from < to) {
      TextAttributes changed = run.attributes;
      changed.*member = value;
      push(result, {from, to - from}, changed);
    }
    push(result, {to, end(run.range) - to}, run.attributes);
  }
  return result;
}

template <class Attribute>
void addAttribute(std::vector<TextRun>& runs, std::optional<Attribute> TextAttributes::*member,
                  const std::optional<Attribute>& value, TextRange range, std::size_t length) {
  if (!value) {
    throw InvalidArgumentException(
        "-[NSMutableAttributedString addAttribute:value:range:]: nil value");
  }
  requireRange(range, length);
  runs = withAttribute(runs, member, value, range);
}

}  // namespace

AttributedString::AttributedString(std::string text, const TextAttributes& attributes)
    : text_(std::move(text)) {
  push(runs_, {0, text_.size()}, attributes);
}

void AttributedString::append(std::string_view text, const TextAttributes& attributes) {
  const TextRange range{text_.size(), text.size()};
  text_.append(text);
  push(runs_, range, attributes);
}

void AttributedString::beginEditing() { ++editing_; }

void AttributedString::endEditing() {
  if (editing_ == 0) {
    throw RangeException("-[NSMutableAttributedString endEditing]: no edit has begun");
  }
  --editing_;
}

void AttributedString::addFont(const std::optional<Font>& font, TextRange range) {
  addAttribute(runs_, &TextAttributes::font, font, range, length());
}

void AttributedString::addForegroundColor(const std::optional<Color>& color, TextRange range) {
  addAttribute(runs_, &TextAttributes::foregroundColor, color, range, length());
}

void AttributedString::addParagraphStyle(const std::optional<ParagraphStyle>& style,
                                         TextRange range) {
  addAttribute(runs_, &TextAttributes::paragraphStyle, style, range, length());
}

}  // namespace qz::toolkit
