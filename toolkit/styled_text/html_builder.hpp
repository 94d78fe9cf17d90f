// SPDX-License-Identifier: MIT
// Turns a document's tags and text into styled text: tracks the open elements, closes those that a
// tag closes implicitly, and writes what each stands for.
//
// Formatting survives overlapping elements: in `<b><i></b>x</i>` x is italic, and in
// `<p><i></p><p>x</i></p>` it is too. So the end tag of formatting removes its element and keeps
// those inside. Any other end tag suspends the formatting that it closes, until the next text
// resumes it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

#include "toolkit/styled_text/html_style.hpp"
#include "toolkit/styled_text/html_tags.hpp"
#include "toolkit/styled_text/html_text_flow.hpp"
#include "toolkit/styled_text/list_markers.hpp"

namespace qz::toolkit::html {

class Builder {
 public:
  explicit Builder(const Fonts& fonts);

  void startTag(Tag tag, const Attributes& attributes);
  void endTag(Tag tag);
  void addText(std::string_view bytes);

  /// Closes the open elements and returns the text. The builder must not be used afterwards.
  AttributedString finish();

 private:
  /// How a list marks its items, and the number of the next item.
  struct List {
    MarkerKind marker = MarkerKind::disc;
    std::int64_t number = 1;
  };

  /// Whether a row has a cell yet, and where its text begins.
  struct Row {
    bool hasCell = false;
    std::size_t textBegin = 0;
  };

  struct Element {
    Tag tag = Tag::unknown;
    /// On the heap, because styles point into it.
    std::unique_ptr<const Declarations> declarations;
    Style style;
    List list;                              ///< for a list
    Row row;                                ///< for a row
    std::vector<Element> suspendedOutside;  ///< for a cell or caption
  };

  /// The position of an open element. 0 means "none": it is the document itself, which is never
  /// searched for.
  using Position = std::size_t;

  void endHead();
  void colorLinks(const Attributes& body);
  void open(Tag tag, const Attributes& attributes);
  void push(Tag tag, Declarations declarations);
  void push(Element element);
  Element pop();

  void closeForStart(Tag tag);
  void closeForTablePart(Tag part);
  bool closeNearest(const TagSet& wanted, const TagSet& barriers = {});
  void closeFrom(Position first);
  void leave(const Element& element);
  void endFormatting(Tag tag);
  void suspend(Element formatting);
  void resumeFormatting();
  void restyleFrom(Position first);

  void enter(Tag tag, const Attributes& attributes);
  void startList(const Attributes& attributes);
  void startItem(const Attributes& attributes);
  void startCell();
  void breakLine();
  void writeImage();
  void writeRule();

  Position nearest(const TagSet& wanted, const TagSet& barriers = {}) const;
  std::size_t countOpen(const TagSet& wanted) const;
  const Style& style() const { return elements_.back().style; }

  StyleSource source_;
  std::vector<Element> elements_;   // the open elements; the document comes first
  std::vector<Element> suspended_;  // suspended formatting, innermost first
  TextFlow flow_;
  bool inHead_ = false;
  bool isPastHead_ = false;    // the body has begun; a later head is stray
  bool linksColored_ = false;  // a body has set the links' colour
  bool dropsNewLine_ = false;  // directly after <pre>
};

}  // namespace qz::toolkit::html
