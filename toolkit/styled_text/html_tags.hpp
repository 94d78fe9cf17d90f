// SPDX-License-Identifier: MIT
// The elements and attributes of HTML 4.01 that the reader supports, and sets of them. Other
// elements (areas, form controls, frames, script containers) do not affect styled text: their tags
// are ignored, their content is read.
#pragma once

#include <array>
#include <bitset>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>

namespace qz::toolkit::html {

/// In alphabetical order, like the table of names.
// clang-format off
enum class Tag : std::uint8_t {
  a, abbr, acronym, address, b, bdo, big, blockquote, body, br, caption, center, cite, code, dd,
  del, dfn, dir, div, dl, dt, em, fieldset, font, form, h1, h2, h3, h4, h5, h6, head, hr, html, i,
  img, ins, kbd, label, legend, li, menu, ol, p, pre, q, s, samp, script, small, span, strike,
  strong, style, sub, sup, table, tbody, td, tfoot, th, thead, title, tr, tt, u, ul, var, unknown
};
// clang-format on

/// Returns the tag of that name; ignores case.
Tag tagNamed(std::string_view name);

class TagSet {
 public:
  constexpr TagSet(std::initializer_list<Tag> tags) {
    for (const Tag tag : tags) bits_[index(tag)] |= bit(tag);
  }

  constexpr bool contains(Tag tag) const { return (bits_[index(tag)] & bit(tag)) != 0; }

  friend constexpr TagSet operator|(TagSet a, const TagSet& b) {
    for (std::size_t i = 0; i < a.bits_.size(); ++i) a.bits_[i] |= b.bits_[i];
    return a;
  }

 private:
  static constexpr std::size_t index(Tag tag) { return static_cast<std::size_t>(tag) / 64; }
  static constexpr std::uint64_t bit(Tag tag) {
    return std::uint64_t{1} << (static_cast<std::size_t>(tag) % 64);
  }

  std::array<std::uint64_t, 2> bits_{};
};

/// Sets of elements that are treated alike.
namespace tags {

inline constexpr TagSet headings{Tag::h1, Tag::h2, Tag::h3, Tag::h4, Tag::h5, Tag::h6};
inline constexpr TagSet lists{Tag::dir, Tag::menu, Tag::ol, Tag::ul};
inline constexpr TagSet cells{Tag::td, Tag::th};
inline constexpr TagSet rowGroups{Tag::tbody, Tag::tfoot, Tag::thead};
/// Elements that hold rows and cells but no text directly.
inline constexpr TagSet tableParts = TagSet{Tag::table, Tag::tr} | rowGroups;
/// Elements that begin and end with a new line. `address` is not one: it is only set in italics.
inline constexpr TagSet blocks =
    headings | lists | TagSet{Tag::blockquote, Tag::caption, Tag::center,   Tag::dd,    Tag::div,
                              Tag::dl,         Tag::dt,      Tag::fieldset, Tag::form,  Tag::legend,
                              Tag::li,         Tag::p,       Tag::pre,      Tag::table, Tag::tr};
/// Elements that survive the end of an enclosing element, until their own end tag: in
/// `<p><b>x</p><p>y</b>`, y is bold.
inline constexpr TagSet formatting{Tag::a,      Tag::b,  Tag::big, Tag::code,  Tag::em,
                                   Tag::font,   Tag::i,  Tag::s,   Tag::small, Tag::strike,
                                   Tag::strong, Tag::tt, Tag::u};
/// Elements into which formatting does not continue, and beyond which its end tags do not look.
inline constexpr TagSet formattingBarriers = cells | TagSet{Tag::caption};
/// Elements at which the search for the element that an end tag closes stops.
inline constexpr TagSet scopes = formattingBarriers | TagSet{Tag::table};

}  // namespace tags

// clang-format off
enum class Attribute : std::uint8_t {
  align, bgcolor, color, face, href, link, size, start, style, text, type, value, vlink, unknown
};
// clang-format on

/// Returns the attribute of that name; ignores case.
Attribute attributeNamed(std::string_view name);

/// The attributes of a start tag, as views of the document. If a name occurs twice, the first
/// counts.
class Attributes {
 public:
  void clear() { present_.reset(); }
  void add(Attribute attribute, std::string_view writtenValue);

  /// Returns the value with character references decoded; absent if the tag lacks the attribute.
  std::optional<std::string> operator[](Attribute attribute) const;

 private:
  static constexpr std::size_t count = static_cast<std::size_t>(Attribute::unknown);

  std::array<std::string_view, count> values_;
  std::bitset<count> present_;  // which of `values_` are set
};

}  // namespace qz::toolkit::html
