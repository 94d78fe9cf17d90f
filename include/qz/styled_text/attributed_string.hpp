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

enum class TextAlignment : int { left = 0, right = 1, center = 2, justified = 3, natural = 4 };

/// Layout of whole paragraphs. Lengths are points.
struct QZ_API ParagraphStyle {
  TextAlignment alignment = TextAlignment::natural;
  double firstLineHeadIndent = 0;
  double headIndent = 0;  ///< of the other lines; if greater, the first line hangs

  friend bool operator==(const ParagraphStyle&, const ParagraphStyle&) = default;
};

/// The address that a click on a link opens. Copies share one text, so splitting a link into runs
/// costs nothing extra, however long the address.
class QZ_API Link {
 public:
  // Implicit, so that an address can be assigned to a link.
  Link(std::string address) : address_(std::make_shared<const std::string>(std::move(address))) {}
  Link(const char* address) : Link(std::string(address)) {}

  const std::string& address() const { return *address_; }
  operator const std::string&() const { return *address_; }

  friend bool operator==(const Link& a, const Link& b) {
    return a.address_ == b.address_ || *a.address_ == *b.address_;
  }

 private:
  std::shared_ptr<const std::string> address_;
};

/// The attributes of a run. The widget that draws the text chooses the absent ones.
struct QZ_API TextAttributes {
  std::optional<Font> font{};
  std::optional<Color> foregroundColor{};
  std::optional<Color> backgroundColor{};
  std::optional<ParagraphStyle> paragraphStyle{};
  std::optional<Link> link{};
  bool underline = false;
  bool strikethrough = false;
  int superscript = 0;  ///< steps above the baseline; negative: below it

  friend bool operator==(const TextAttributes&, const TextAttributes&) = default;
};

struct QZ_API TextRange {
  std::size_t location = 0;
  std::size_t length = 0;

  friend bool operator==(const TextRange&, const TextRange&) = default;
};

struct QZ_API TextRun {
  TextRange range;
  TextAttributes attributes;

  friend bool operator==(const TextRun&, const TextRun&) = default;
};

class QZ_API AttributedString {
 public:
  AttributedString() = default;
  explicit AttributedString(std::string text, const TextAttributes& attributes = {});

  const std::string& string() const { return text_; }
  std::size_t length() const { return text_.size(); }
  const std::vector<TextRun>& runs() const { return runs_; }

  /// Appends `text` with `attributes`.
  void append(std::string_view text, const TextAttributes& attributes);

  /// Makes the changes between these calls one edit: readers of the text see only the final result.
  /// Edits nest. An `endEditing` without its `beginEditing` raises a range exception.
  void beginEditing();
  void endEditing();

  /// Sets one attribute over `range`, leaving the others. Raises an invalid-argument exception for
  /// an absent value and a range exception for a range beyond the text's end; then nothing changes.
  void addFont(const std::optional<Font>& font, TextRange range);
  void addForegroundColor(const std::optional<Color>& color, TextRange range);
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
