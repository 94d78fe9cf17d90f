// The names of elements and attributes.
#include "toolkit/styled_text/html_tags.hpp"

#include <algorithm>

#include "toolkit/styled_text/html_entities.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace toolkit::html {
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

static_assert(std::is_sorted(tagNames.begin(), tagNames.end()));
static_assert(std::is_sorted(attributeNames.begin(), attributeNames.end()));

constexpr std::size_t longestName = 10;

/// Where `name`, in whatever case, stands in `names`; at their end, where it does not.
template <std::size_t N>
std::size_t indexOf(const Names<N>& names, std::string_view name) {
  if (name.size() > longestName) return N;
  std::array<char, longestName> letters{};
  std::transform(name.begin(), name.end(), letters.begin(), [](char c) { return lowered(c); });
  const std::string_view key(letters.data(), name.size());
  const auto found = std::lower_bound(names.begin(), names.end(), key);
  return found != names.end() && *found == key ? static_cast<std::size_t>(found - names.begin())
                                               : N;
}

}  // namespace

Tag tagNamed(std::string_view name) { return static_cast<Tag>(indexOf(tagNames, name)); }

Attribute attributeNamed(std::string_view name) {
  return static_cast<Attribute>(indexOf(attributeNames, name));
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

}  // namespace toolkit::html
