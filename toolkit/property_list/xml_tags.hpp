// SPDX-License-Identifier: MIT
// The spelling of the tags of XML property lists.
#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "text/words.hpp"

namespace qz::toolkit {

enum class XmlElement : std::uint8_t {
  plist,
  array,
  dictionary,
  key,
  string,
  integer,
  real,
  date,
  data,
  yes,
  no
};

constexpr std::array<std::string_view, 11> xmlTagNames = {
    "plist", "array", "dict", "key", "string", "integer", "real", "date", "data", "true", "false"};

/// Returns the tag name of an element, such as "dict".
constexpr std::string_view tagName(XmlElement element) {
  return xmlTagNames[static_cast<std::size_t>(element)];
}

/// A tag without attributes or spaces, from its name to its `>`. It fits in one word, so one
/// comparison recognises it; nearly all tags in files have this form.
struct PlainTag {
  XmlElement element = XmlElement::plist;
  bool selfClosed = false;
  std::uint64_t word = 0;
  std::uint64_t mask = 0;
  std::size_t size = 0;

  constexpr PlainTag() = default;
  constexpr PlainTag(XmlElement tagElement, bool isSelfClosed)
      : element(tagElement), selfClosed(isSelfClosed) {
    std::array<char, text::words::size> characters{};
    std::array<char, text::words::size> used{};
    const auto append = [&](char c) {
      characters[size] = c;
      used[size++] = '\xFF';
    };
    for (const char c : tagName(element)) append(c);
    if (selfClosed) append('/');
    append('>');
    word = std::bit_cast<std::uint64_t>(characters);
    mask = std::bit_cast<std::uint64_t>(used);
  }

  bool matches(std::uint64_t text) const { return (text & mask) == word; }
};

/// The opening tags, the most frequent first.
constexpr std::array plainTags = {
    PlainTag(XmlElement::string, false),     PlainTag(XmlElement::integer, false),
    PlainTag(XmlElement::array, false),      PlainTag(XmlElement::key, false),
    PlainTag(XmlElement::dictionary, false), PlainTag(XmlElement::yes, true),
    PlainTag(XmlElement::no, true),          PlainTag(XmlElement::real, false),
    PlainTag(XmlElement::data, false),       PlainTag(XmlElement::date, false),
    PlainTag(XmlElement::string, true),      PlainTag(XmlElement::array, true),
    PlainTag(XmlElement::dictionary, true),  PlainTag(XmlElement::plist, false)};

/// The closing tags without their `</`, by element.
constexpr std::array<PlainTag, xmlTagNames.size()> plainClosingTags = [] {
  std::array<PlainTag, xmlTagNames.size()> tags{};
  for (std::size_t i = 0; i < tags.size(); ++i) {
    tags[i] = PlainTag(static_cast<XmlElement>(i), false);
  }
  return tags;
}();

}  // namespace qz::toolkit
