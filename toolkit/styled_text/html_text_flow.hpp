// SPDX-License-Identifier: MIT
// The text that a document turns into, as it grows: where white space collapses, where new lines
// stand, which attributes hold. A new line belongs to the paragraph that it ends: it has the
// paragraph style of its first character.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/html_style.hpp"

namespace toolkit::html {

/// Each operation takes the style of what it writes.
class TextFlow {
 public:
  /// Text (UTF-8) of the document. Unless the style is preformatted, white space collapses to one
  /// space, also across calls, and is dropped at the start of a line.
  void addText(std::string_view text, const Style& style);

  /// What the reader puts in by itself, as it stands.
  void addCharacters(std::string_view characters, const Style& style);

  /// "\t", the marker, "\t". The line it opens hangs: it begins one indent further out.
  void addMarker(std::string_view marker, const Style& style);

  /// A tab between two cells.
  void addCellTab(const Style& style);

  /// `<br>`: a new line, or within a paragraph a line separator (U+2028).
  void breakLine(bool withinParagraph, const Style& style);

  /// A new line, unless there is nothing on the current one but a marker or a cell's tab.
  void startBlock(const Style& style);

  /// A new line, unless the current one is empty.
  void endLine(const Style& style);

  bool isLineEmpty() const { return length() == lineBegin_; }
  std::size_t length() const { return text_.length(); }

  AttributedString take() { return std::move(text_); }

 private:
  /// What the text ends with.
  enum class End : std::uint8_t { newLine, lineSeparator, opening, space, character };

  std::string_view collapsed(std::string_view text);
  std::string_view withPlainLineEnds(std::string_view text);
  void append(std::string_view text, const Style& style);
  void append(std::string_view text, const Style& style, End end);

  AttributedString text_;
  End end_ = End::newLine;  // a text begins as a new line does
  std::size_t lineBegin_ = 0;
  std::optional<ParagraphStyle> paragraph_;  // of the current line's first character
  bool hanging_ = false;                     // the current line begins with a marker
  std::string scratch_;                      // kept for its memory
};

}  // namespace toolkit::html
