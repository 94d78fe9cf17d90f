// SPDX-License-Identifier: MIT
// Turns a document's tags and text into styled text: which elements are open, what a tag closes
// besides, what each writes.
//
// Where elements overlap, formatting goes on: in `<b><i></b>x</i>` x is in italics, and in
// `<p><i></p><p>x</i></p>` it is as well. So the end tag of formatting takes its element out from
// under those within it, and any other end tag suspends the formatting that it closes, until the
// next text resumes it.
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

namespace toolkit::html {

class Builder {
 public:
  explicit Builder(const Fonts& fonts);

  void startTag(Tag tag, const Attributes& attributes);
  void endTag(Tag tag);
  void addText(std::string_view bytes);

  /// Closes what is open. The builder is done with.
  AttributedString finish();

 private:
  /// How the items of a list are marked, and the number of the next.
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
    /// On the heap, for styles point to what they hold.
    std::unique_ptr<const Declarations> declarations;
    Style style;
    List list;                              ///< of a list
    Row row;                                ///< of a row
    std::vector<Element> suspendedOutside;  ///< of a cell: it begins with nothing suspended
  };

  /// The position of an open element. The document itself, at 0, is never looked for: 0 is "none".
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
  std::vector<Element> elements_;   // the open ones, the document first
  std::vector<Element> suspended_;  // formatting, the innermost first
  TextFlow flow_;
  bool inHead_ = false;
  bool isPastHead_ = false;    // the body has begun: a head is a stray tag from here
  bool linksColored_ = false;  // a body has said which colour links have
  bool dropsNewLine_ = false;  // directly behind <pre>
};

}  // namespace toolkit::html
