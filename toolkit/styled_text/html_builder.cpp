// SPDX-License-Identifier: MIT
// Tags open and close elements mostly as in browsers: a paragraph ends where a block begins, an
// item ends where the next begins, and formatting survives its block.
#include "toolkit/styled_text/html_builder.hpp"

#include <algorithm>
#include <string>
#include <utility>

#include "toolkit/styled_text/html_colors.hpp"
#include "toolkit/styled_text/html_entities.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

/// Deeper elements replace their parents, as in browsers. This bounds the cost of a tag.
constexpr std::size_t maxDepth = 256;
constexpr std::size_t maxSuspended = 16;

constexpr TagSet paragraphs = tags::headings | TagSet{Tag::li, Tag::p};
constexpr TagSet partsOfTables = tags::cells | tags::rowGroups | TagSet{Tag::caption, Tag::tr};

/// The elements at which the search for the element that an end tag closes stops.
TagSet barriersOf(Tag tag) {
  if (tag == Tag::table) return {};
  if (partsOfTables.contains(tag)) return {Tag::table};
  if (tag == Tag::li) return tags::lists | tags::scopes;
  return tags::blocks.contains(tag) ? tags::scopes : tags::blocks | tags::scopes;
}

/// The elements that can hold this part of a table.
TagSet holdersOf(Tag part) {
  if (tags::cells.contains(part)) return tags::tableParts;
  if (part == Tag::tr) return tags::rowGroups | TagSet{Tag::table};
  return {Tag::table};
}

std::optional<MarkerKind> markerKind(const Attributes& attributes) {
  const auto type = attributes[Attribute::type];
  return type ? markerKindNamed(*type) : std::nullopt;
}

bool isWhiteSpace(std::string_view text) { return std::all_of(text.begin(), text.end(), isSpace); }

}  // namespace

Builder::Builder(const Fonts& fonts) : source_{fonts} {
  Declarations document;
  document.face = commonFont(fonts);
  push(Tag::html, std::move(document));
}

void Builder::startTag(Tag tag, const Attributes& attributes) {
  if (tag == Tag::unknown || tag == Tag::html) return;
  dropsNewLine_ = false;
  if (tag == Tag::head) {
    inHead_ = !isPastHead_;
    return;
  }
  endHead();  // a tag that is not allowed in a head ends it
  switch (tag) {
    case Tag::br:
      breakLine();
      break;
    case Tag::hr:
      writeRule();
      break;
    case Tag::img:
      writeImage();
      break;
    case Tag::body:
      colorLinks(attributes);
      push(tag, declarationsOf(tag, attributes, source_));
      break;
    default:
      open(tag, attributes);
  }
}

void Builder::endTag(Tag tag) {
  dropsNewLine_ = false;
  if (tag == Tag::head) endHead();
  if (inHead_) return;
  if (tag == Tag::br) {
    endHead();
    breakLine();
  } else if (tag == Tag::p) {
    endHead();
    // Without its start tag it makes an empty paragraph.
    if (!closeNearest({tag}, tags::scopes)) flow_.startBlock(style());
  } else if (tags::headings.contains(tag)) {
    closeNearest(tags::headings, tags::scopes);
  } else if (tags::formatting.contains(tag)) {
    endFormatting(tag);
  } else if (tag != Tag::body) {  // which ends with the document
    closeNearest({tag}, barriersOf(tag));
  }
}

void Builder::addText(std::string_view bytes) {
  const bool dropsNewLine = std::exchange(dropsNewLine_, false);
  if (inHead_) return;
  std::string read;
  if (!isPlain(bytes)) bytes = read = decoded(bytes, ReferencePlace::text);
  if (!isPastHead_ && !isWhiteSpace(bytes)) endHead();
  // White space between the parts of a table is source layout, not text.
  if (tags::tableParts.contains(elements_.back().tag) && isWhiteSpace(bytes)) return;
  if (dropsNewLine) {
    if (bytes.starts_with('\r')) bytes.remove_prefix(1);
    if (bytes.starts_with('\n')) bytes.remove_prefix(1);
  }
  resumeFormatting();
  flow_.addText(bytes, style());
}

void Builder::endHead() {
  inHead_ = false;
  isPastHead_ = true;
}

AttributedString Builder::finish() {
  while (elements_.size() > 1) leave(pop());
  return flow_.take();
}

/// If several bodies set a colour, the first one counts.
void Builder::colorLinks(const Attributes& body) {
  for (const Attribute name : {Attribute::link, Attribute::vlink}) {
    const auto value = linksColored_ ? std::nullopt : body[name];
    const auto color = value ? attributeColor(*value) : std::nullopt;
    if (!color) continue;
    source_.linkColor = *color;
    linksColored_ = true;
  }
}

void Builder::open(Tag tag, const Attributes& attributes) {
  closeForStart(tag);
  if (tags::lists.contains(tag) || tag == Tag::li) {
    flow_.endLine(style());  // so that two markers never share a line
  } else if (tags::blocks.contains(tag)) {
    flow_.startBlock(style());
  } else if (tags::cells.contains(tag)) {
    startCell();
  } else if (!tags::rowGroups.contains(tag)) {
    resumeFormatting();
  }
  push(tag, declarationsOf(tag, attributes, source_));
  enter(tag, attributes);
}

void Builder::push(Tag tag, Declarations declarations) {
  Element element;
  element.tag = tag;
  element.declarations = std::make_unique<const Declarations>(std::move(declarations));
  push(std::move(element));
}

void Builder::push(Element element) {
  if (elements_.size() == maxDepth) leave(pop());
  if (tags::formattingBarriers.contains(element.tag)) element.suspendedOutside.swap(suspended_);
  elements_.push_back(std::move(element));
  restyleFrom(elements_.size() - 1);
}

Builder::Element Builder::pop() {
  Element element = std::move(elements_.back());
  elements_.pop_back();
  if (tags::formattingBarriers.contains(element.tag)) suspended_.swap(element.suspendedOutside);
  return element;
}

/// Closes the elements that the start of a `tag` element ends.
void Builder::closeForStart(Tag tag) {
  if (tags::blocks.contains(tag)) closeNearest({Tag::p}, tags::scopes);
  if (tags::headings.contains(tag)) closeNearest(tags::headings, tags::blocks | tags::scopes);
  if (tag == Tag::li) closeNearest({tag}, barriersOf(tag));
  if (tag == Tag::dd || tag == Tag::dt) {
    closeNearest({Tag::dd, Tag::dt}, TagSet{Tag::dl} | tags::scopes);
  }
  if (tag == Tag::a) endFormatting(tag);
  if (partsOfTables.contains(tag)) closeForTablePart(tag);
}

/// Closes the open elements inside the table, group or row that will hold `part`.
void Builder::closeForTablePart(Tag part) {
  const Position holder = nearest(holdersOf(part));
  if (holder != 0) {
    closeFrom(holder + 1);
  } else {
    closeNearest({part});
  }
}

bool Builder::closeNearest(const TagSet& wanted, const TagSet& barriers) {
  const Position found = nearest(wanted, barriers);
  if (found != 0) closeFrom(found);
  return found != 0;
}

/// Closes the element at `first` and those inside it; formatting is only suspended.
void Builder::closeFrom(Position first) {
  while (elements_.size() > first) {
    Element element = pop();
    if (tags::formatting.contains(element.tag)) {
      suspend(std::move(element));
    } else {
      leave(element);
    }
  }
}

/// Writes the text for the end of an element that is already removed from the open ones.
void Builder::leave(const Element& element) {
  if (element.tag == Tag::q) {
    const bool outer = countOpen({Tag::q}) % 2 == 0;
    flow_.addCharacters(outer ? "\u201D" : "\u2019", element.style);
  } else if (element.tag == Tag::li || element.tag == Tag::tr) {
    flow_.endLine(element.style);  // even if there was only the marker, or empty cells
  } else if (tags::blocks.contains(element.tag)) {
    flow_.startBlock(element.style);
  }
}

void Builder::endFormatting(Tag tag) {
  const auto suspended = std::find_if(suspended_.begin(), suspended_.end(),
                                      [tag](const Element& element) { return element.tag == tag; });
  if (suspended != suspended_.end()) {
    suspended_.erase(suspended);
  } else if (const Position open = nearest({tag}, tags::formattingBarriers); open != 0) {
    elements_.erase(elements_.begin() + static_cast<std::ptrdiff_t>(open));
    restyleFrom(open);
  }
}

/// Keeps at most three alike, as browsers do, and `maxSuspended` in all, because a tag left open in
/// a paragraph may be left open in thousands. The outer ones end.
void Builder::suspend(Element formatting) {
  const auto alike =
      std::count_if(suspended_.begin(), suspended_.end(), [&formatting](const Element& element) {
        return element.tag == formatting.tag && *element.declarations == *formatting.declarations;
      });
  if (alike < 3 && suspended_.size() < maxSuspended) suspended_.push_back(std::move(formatting));
}

void Builder::resumeFormatting() {
  while (!suspended_.empty()) {
    Element formatting = std::move(suspended_.back());
    suspended_.pop_back();
    push(std::move(formatting));
  }
}

void Builder::restyleFrom(Position first) {
  for (Position i = first; i < elements_.size(); ++i) {
    const Style parent = i == 0 ? Style{} : elements_[i - 1].style;
    elements_[i].style = styleWithin(parent, *elements_[i].declarations);
  }
}

/// Writes the text for the start of an element that is already open.
void Builder::enter(Tag tag, const Attributes& attributes) {
  if (tags::lists.contains(tag)) {
    startList(attributes);
  } else if (tag == Tag::li) {
    startItem(attributes);
  } else if (tag == Tag::tr) {
    elements_.back().row.textBegin = flow_.length();
  } else if (tag == Tag::q) {
    const bool outer = countOpen({Tag::q}) % 2 == 1;
    flow_.addCharacters(outer ? "\u201C" : "\u2018", style());
  }
  dropsNewLine_ = tag == Tag::pre;
}

void Builder::startList(const Attributes& attributes) {
  const bool ordered = elements_.back().tag == Tag::ol;
  List& list = elements_.back().list;
  list.marker = ordered ? MarkerKind::decimal : bulletAtLevel(countOpen(tags::lists));
  list.marker = markerKind(attributes).value_or(list.marker);
  if (const auto start = attributes[Attribute::start]) {
    list.number = leadingInteger(*start).value_or(list.number);
  }
}

void Builder::startItem(const Attributes& attributes) {
  List stray;
  const Position position = nearest(tags::lists, tags::scopes);
  List& list = position != 0 ? elements_[position].list : stray;
  if (const auto value = attributes[Attribute::value]) {
    list.number = leadingInteger(*value).value_or(list.number);
  }
  flow_.addMarker(marker(markerKind(attributes).value_or(list.marker), list.number), style());
  ++list.number;
}

/// Separates the cell from the previous one with a tab, unless the previous one has ended its line.
void Builder::startCell() {
  const Position holder = nearest(tags::tableParts);
  if (holder == 0) return;
  if (elements_[holder].tag != Tag::tr) open(Tag::tr, {});
  Element& element = elements_[nearest({Tag::tr})];
  const bool isFirst = !std::exchange(element.row.hasCell, true);
  const bool nothingYet = flow_.length() == element.row.textBegin;
  if (!isFirst && (nothingYet || !flow_.isLineEmpty())) flow_.addCellTab(element.style);
}

void Builder::breakLine() {
  resumeFormatting();
  flow_.breakLine(nearest(paragraphs) != 0, style());
}

void Builder::writeImage() {
  resumeFormatting();
  flow_.addCharacters("\uFFFC", style());
}

/// Writes a rule, which has no characters, as an empty line.
void Builder::writeRule() {
  closeNearest({Tag::p}, tags::scopes);
  flow_.startBlock(style());
  flow_.breakLine(false, style());
}

Builder::Position Builder::nearest(const TagSet& wanted, const TagSet& barriers) const {
  for (Position i = elements_.size() - 1; i > 0; --i) {
    if (wanted.contains(elements_[i].tag)) return i;
    if (barriers.contains(elements_[i].tag)) return 0;
  }
  return 0;
}

std::size_t Builder::countOpen(const TagSet& wanted) const {
  return static_cast<std::size_t>(
      std::count_if(elements_.begin(), elements_.end(),
                    [&wanted](const Element& element) { return wanted.contains(element.tag); }));
}

}  // namespace qz::toolkit::html
