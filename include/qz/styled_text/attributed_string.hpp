// SPDX-License-Identifier: MIT
// Attributed strings: text with attributes over ranges of it.
//
// Invariants: the runs cover the text without gap or overlap, in order; none is empty; two
// neighbours differ in their attributes. Positions and lengths count bytes of the UTF-8 text, and
// ranges are half-open.
#pragma once

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/api.hpp"
#include "qz/styled_text/color.hpp"
#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit {

/// Where the lines of a paragraph are placed (`NSTextAlignment`).
enum class TextAlignment : int { left = 0, right = 1, center = 2, justified = 3, natural = 4 };

/// Layout of whole paragraphs. Lengths are points.
struct QZ_API ParagraphStyle {
  TextAlignment alignment = TextAlignment::natural;  ///< where lines are placed
  double firstLineHeadIndent = 0;                    ///< in points
  double headIndent = 0;  ///< of the other lines; if greater, the first line hangs

  friend bool operator==(const ParagraphStyle&, const ParagraphStyle&) = default;
};

/// The address that a click on a link opens. Copies share one text, so splitting a link into runs
/// costs nothing extra, however long the address.
class QZ_API Link {
 public:
  /// Makes a link to the address. Implicit, so that an address can be assigned to a link.
  Link(std::string address) : address_(std::make_shared<const std::string>(std::move(address))) {}
  /// The same.
  Link(const char* address) : Link(std::string(address)) {}

  /// Returns the address, as HTML gives it.
  const std::string& address() const { return *address_; }
  /// Returns the address.
  operator const std::string&() const { return *address_; }

  friend bool operator==(const Link& a, const Link& b) {
    return a.address_ == b.address_ || *a.address_ == *b.address_;
  }

 private:
  std::shared_ptr<const std::string> address_;
};

/// The attributes of a run. The widget that draws the text chooses the absent ones.
struct QZ_API TextAttributes {
  std::optional<Font> font{};                      ///< absent for the control's own font
  std::optional<Color> foregroundColor{};          ///< absent for the control's own colour
  std::optional<Color> backgroundColor{};          ///< absent for none
  std::optional<ParagraphStyle> paragraphStyle{};  ///< absent for the control's own paragraphs
  std::optional<Link> link{};                      ///< absent for none
  bool underline = false;                          ///< whether a line is drawn below the text
  bool strikethrough = false;                      ///< whether a line is drawn through the text
  int superscript = 0;                             ///< steps above the baseline; negative: below it

  friend bool operator==(const TextAttributes&, const TextAttributes&) = default;
};

/// A part of a text, in bytes.
struct QZ_API TextRange {
  std::size_t location = 0;  ///< the first byte
  std::size_t length = 0;    ///< the number of bytes

  friend bool operator==(const TextRange&, const TextRange&) = default;
};

/// A part of a text whose attributes are the same.
struct QZ_API TextRun {
  TextRange range;            ///< never empty
  TextAttributes attributes;  ///< of every character in it

  friend bool operator==(const TextRun&, const TextRun&) = default;
};

/// A text whose parts have attributes.
class QZ_API AttributedString {
 public:
  AttributedString() = default;
  /// Makes a text with the same attributes everywhere.
  explicit AttributedString(std::string text, const TextAttributes& attributes = {});

  /// Returns the text without attributes, in UTF-8.
  const std::string& string() const { return text_; }
  /// Returns the length of the text in bytes.
  std::size_t length() const { return text_.size(); }
  /// Returns the runs, which cover the text without gaps.
  const std::vector<TextRun>& runs() const { return runs_; }

  /// Appends `text` with `attributes`.
  void append(std::string_view text, const TextAttributes& attributes);

  /// Makes the changes between these calls one edit: readers of the text see only the final result.
  /// Edits nest. An `endEditing` without its `beginEditing` raises a range exception.
  void beginEditing();
  /// Ends the changes that `beginEditing` began.
  void endEditing();

  /// Sets one attribute over `range`, leaving the others. Raises an invalid-argument exception for
  /// an absent value and a range exception for a range beyond the text's end; then nothing changes.
  void addFont(const std::optional<Font>& font, TextRange range);
  /// Sets the colour of the text, as `addFont` sets its font.
  void addForegroundColor(const std::optional<Color>& color, TextRange range);
  /// Sets the paragraph style, as `addFont` sets the font.
  void addParagraphStyle(const std::optional<ParagraphStyle>& style, TextRange range);

  friend bool operator==(const AttributedString& a, const AttributedString& b) {
    return a.text_ == b.text_ && a.runs_ == b.runs_;
  }

 private:
  std::string text_;
  std::vector<TextRun> runs_;
  int editing_ = 0;  // depth of open edits
};

}  // namespace qz::toolkit
