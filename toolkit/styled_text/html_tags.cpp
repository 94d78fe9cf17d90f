// SPDX-License-Identifier: MIT
// The names of elements and attributes.
#include "toolkit/styled_text/html_tags.hpp"

#include <algorithm>

#include "toolkit/styled_text/html_entities.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

template <std::size_t N>
using Names = std::array<std::string_view, N>;

// In the order of the enumerations.
constexpr Names<static_cast<std::size_t>(Tag::unknown)> tagNames = {
    "a",   "abbr",    "acronym", "address", "b",        "bdo",   "big",    "blockquote", "body",
    "br",  "caption", "center",  "cite",    "code",     "dd",    "del",    "dfn",        "dir",
    "div", "dl",      "dt",      "em",      "fieldset", "font",  "form",   "h1",         "h2",
    "h3",  "h4",      "h5",      "h6",      "head",     "hr",    "html",   "i",          "img",
    "ins", "kbd",     "label",   "legend",  "li",       "menu",  "ol",     "p",          "pre",
    "q",   "s",       "samp",    "script",  "small",    "span",  "strike", "strong",     "style",
    "sub", "sup",     "table",   "tbody",   "td",       "tfoot", "th",     "thead",      "title",
    "tr",  "tt",      "u",       "ul",      "var"};

constexpr Names<static_cast<std::size_t>(Attribute::unknown)> attributeNames = {
    "align", "bgcolor", "color", "face", "href",  "link", "size",
    "start", "style",   "text",  "type", "value", "vlink"};

constexpr std::size_t longestTag = 10;

/// Packs a name into one number, six bits a character, ignoring case, so that names compare quickly
/// and in order. Returns 0 for other texts: too long, or with characters other than letters and
/// digits.
constexpr std::uint64_t packed(std::string_view name) {
  if (name.size() > longestTag) return 0;
  std::uint64_t number = 0;
  for (const char c : name) {
    if (!isLetter(c) && !text::isDigit(c)) return 0;
    number = number << 6 |
             static_cast<unsigned>(text::isDigit(c) ? c - '0' + 1 : text::lowered(c) - 'a' + 11);
  }
  return number << 6 * (longestTag - name.size());
}

template <std::size_t N>
constexpr std::array<std::uint64_t, N> packed(const Names<N>& names) {
  std::array<std::uint64_t, N> numbers{};
  for (std::size_t i = 0; i < N; ++i) numbers[i] = packed(names[i]);
  return numbers;
}

constexpr auto tagNumbers = packed(tagNames);
constexpr auto attributeNumbers = packed(attributeNames);
static_assert(std::is_sorted(tagNumbers.begin(), tagNumbers.end()) && tagNumbers.front() != 0);
static_assert(std::is_sorted(attributeNumbers.begin(), attributeNumbers.end()) &&
              attributeNumbers.front() != 0);

/// Returns the index of `name` in `numbers`; N if it is not there.
template <std::size_t N>
std::size_t indexOf(const std::array<std::uint64_t, N>& numbers, std::string_view name) {
  const std::uint64_t number = packed(name);
  const auto found = std::lower_bound(numbers.begin(), numbers.end(), number);
  return found != numbers.end() && *found == number
             ? static_cast<std::size_t>(found - numbers.begin())
             : N;
}

}  // namespace

Tag tagNamed(std::string_view name) { return static_cast<Tag>(indexOf(tagNumbers, name)); }

Attribute attributeNamed(std::string_view name) {
  return static_cast<Attribute>(indexOf(attributeNumbers, name));
}

void Attributes::add(Attribute attribute, std::string_view writtenValue) {
  const auto index = static_cast<std::size_t>(attribute);
  if (index >= count || present_[index]) return;
  present_.set(index);
  values_[index] = writtenValue;
}

std::optional<std::string> Attributes::operator[](Attribute attribute) const {
  const auto index = static_cast<std::size_t>(attribute);
  if (!present_[index]) return std::nullopt;
  return decoded(values_[index], ReferencePlace::attribute);
}

}  // namespace qz::toolkit::html
