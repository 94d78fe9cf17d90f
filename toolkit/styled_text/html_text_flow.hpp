// SPDX-License-Identifier: MIT
// Builds the text of a document: collapses white space, places new lines, applies attributes. A new
// line belongs to the paragraph that it ends: it has the paragraph style of its first character.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "qz/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/html_style.hpp"

namespace qz::toolkit::html {

/// Each operation takes the style of the text that it writes.
class TextFlow {
 public:
  /// Adds text (UTF-8) of the document. Unless the style is preformatted, white space collapses to
  /// one space, even across calls, and is dropped at the start of a line.
  void addText(std::string_view text, const Style& style);

  /// Adds the reader's own characters unchanged.
  void addCharacters(std::string_view characters, const Style& style);

  /// Adds "\t", the marker, "\t". The line hangs: it begins one indent further left.
  void addMarker(std::string_view marker, const Style& style);

  /// Adds a tab between two cells.
  void addCellTab(const Style& style);

  /// Adds a `<br>`: a new line, or within a paragraph a line separator (U+2028).
  void breakLine(bool withinParagraph, const Style& style);

  /// Adds a new line, unless the current one has only a marker or a cell's tab, or is empty.
  void startBlock(const Style& style);

  /// Adds a new line, unless the current one is empty.
  void endLine(const Style& style);

  bool isLineEmpty() const { return length() == lineBegin_; }
  std::size_t length() const { return text_.length(); }

  AttributedString take() { return std::move(text_); }

 private:
  /// How the text ends.
  enum class End : std::uint8_t { newLine, lineSeparator, opening, space, character };

  std::string_view collapsed(std::string_view text);
  std::string_view withPlainLineEnds(std::string_view text);
  void append(std::string_view text, const Style& style);
  void append(std::string_view text, const Style& style, End end);

  AttributedString text_;
  End end_ = End::newLine;  // a text begins like a new line
  std::size_t lineBegin_ = 0;
  std::optional<ParagraphStyle> paragraph_;  // from the current line's first character
  bool hanging_ = false;                     // the current line begins with a marker
  std::string scratch_;                      // kept to reuse its memory
};

}  // namespace qz::toolkit::html
