// Turns a document's tags and text into styled text: which elements are open, what a tag closes
// besides, what each writes.
//
// Where elements overlap, formatting that is still open goes on behind the element that ends: in
// `<b><i></b>x</i>` x is in italics. So an end tag takes its element out from under the others
// where it is formatting, and closes the others with it where it is not.
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
  struct Element {
    Tag tag;
    /// On the heap, for styles point to what they hold.
    std::unique_ptr<const Declarations> declarations;
    Style style;
    // Of a list: how its items are marked, and the number of the next.
    MarkerKind marker = MarkerKind::disc;
    std::int64_t number = 1;
    // Of a row: whether it has a cell yet, and where its text begins.
    bool hasCell = false;
    std::size_t textBegin = 0;
  };

  /// The position of an open element. The body, at 0, is never looked for: 0 is "none".
  using Position = std::size_t;

  void readBody(const Attributes& attributes);
  void open(Tag tag, const Attributes& attributes);
  void push(Tag tag, const Attributes& attributes);

  void closeForStart(Tag tag);
  void closeForTablePart(Tag tag);
  bool closeNearest(const TagSet& wanted, const TagSet& barriers);
  void closeFrom(Position first);
  void leave(const Element& element);
  void removeFormatting(Tag tag);
  void restyleFrom(Position first);

  void startList(Element& list, const Attributes& attributes);
  void writeMarker(const Attributes& attributes);
  void startCell();
  void breakLine();
  void writeRule();

  Position nearest(const TagSet& wanted, const TagSet& barriers = {}) const;
  std::size_t countOpen(const TagSet& wanted) const;
  const Style& style() const { return elements_.back().style; }

  StyleSource source_;
  std::vector<Element> elements_;  // the open ones, the body first
  TextFlow flow_;
  bool inHead_ = false;
  bool linkColored_ = false;       // a body has said which colour links have
  bool dropsNewLine_ = false;      // directly behind <pre>
};

}  // namespace toolkit::html
