// SPDX-License-Identifier: MIT
// White space and lines.
#include "toolkit/styled_text/html_text_flow.hpp"

#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {

void TextFlow::addText(std::string_view text, const Style& style) {
  append(style.preformatted ? withPlainLineEnds(text) : collapsed(text), style);
}

void TextFlow::addCharacters(std::string_view characters, const Style& style) {
  append(characters, style, End::character);
}

void TextFlow::addMarker(std::string_view marker, const Style& style) {
  hanging_ = true;
  append('\t' + std::string(marker) + '\t', style, End::opening);
}

void TextFlow::addCellTab(const Style& style) { append("\t", style, End::opening); }

void TextFlow::breakLine(bool withinParagraph, const Style& style) {
  if (withinParagraph) {
    append("\u2028", style, End::lineSeparator);
  } else {
    append("\n", style, End::newLine);
  }
}

void TextFlow::startBlock(const Style& style) {
  if (end_ != End::opening) endLine(style);
}

void TextFlow::endLine(const Style& style) {
  if (!isLineEmpty()) append("\n", style, End::newLine);
}

/// Returns `text` with white space collapsed; reads and updates `end_`.
std::string_view TextFlow::collapsed(std::string_view text) {
  scratch_.clear();
  for (const char c : text) {
    if (!isSpace(c)) {
      scratch_ += c;
      end_ = End::character;
    } else if (end_ == End::character) {
      scratch_ += ' ';
      end_ = End::space;
    }
  }
  return scratch_;
}

/// Returns `text` unchanged except that every line end becomes "\n".
std::string_view TextFlow::withPlainLineEnds(std::string_view text) {
  scratch_.clear();
  for (std::size_t i = 0; i < text.size(); ++i) {
    const bool pair = text.substr(i, 2) == "\r\n";
    if (!pair) scratch_ += text[i] == '\r' ? '\n' : text[i];
  }
  if (!text.empty()) end_ = scratch_.back() == '\n' ? End::newLine : End::character;
  return scratch_;
}

void TextFlow::append(std::string_view text, const Style& style, End end) {
  append(text, style);
  end_ = end;
}

void TextFlow::append(std::string_view text, const Style& style) {
  while (!text.empty()) {
    const bool endsLine = text.front() == '\n';
    const std::string_view part = endsLine ? text.substr(0, 1) : text.substr(0, text.find('\n'));
    TextAttributes attributes = textAttributes(style, hanging_);
    if (isLineEmpty()) paragraph_ = attributes.paragraphStyle;
    if (endsLine) attributes.paragraphStyle = paragraph_;
    text_.append(part, attributes);
    if (endsLine) {
      hanging_ = false;
      lineBegin_ = length();
    }
    text.remove_prefix(part.size());
  }
}

}  // namespace qz::toolkit::html
