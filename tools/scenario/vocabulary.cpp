// SPDX-License-Identifier: MIT
// Values as scenarios write them.

#include "tools/scenario/vocabulary.hpp"

#include <algorithm>
#include <cassert>
#include <utility>

#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

struct NamedValue {
  Takes takes;
  std::string_view word;
  Wanted wanted;
};

/// Words that mean a value where its kind is accepted, and are plain text elsewhere.
const std::vector<NamedValue>& namedValues() {
  using Kind = Wanted::Kind;
  static const std::vector<NamedValue> values = {
      {Takes::absent, "absent", {Kind::absent, {}}},
      {Takes::present, "present", {Kind::present, {}}},
      {Takes::empty, "empty", {Kind::empty, {}}},
      {Takes::flag, "YES", {Kind::value, true}},
      {Takes::flag, "NO", {Kind::value, false}},
      {Takes::flag, "true", {Kind::value, true}},
      {Takes::flag, "false", {Kind::value, false}},
      {Takes::state, "on", {Kind::value, 1}},
      {Takes::state, "off", {Kind::value, 0}},
      {Takes::state, "mixed", {Kind::value, -1}},
      {Takes::mixed, "mixed", {Kind::value, "mixed"}},
  };
  return values;
}

std::optional<Wanted> readBare(const std::string& text, Takes takes) {
  for (const auto& named : namedValues()) {
    if (includes(takes, named.takes) && text == named.word) return named.wanted;
  }
  if (!includes(takes, Takes::whole | Takes::number)) return std::nullopt;
  const auto number = numberIn(text);
  if (!number || (!includes(takes, Takes::number) && !number->is_number_integer())) {
    return std::nullopt;
  }
  return Wanted{Wanted::Kind::value, *number};
}

struct KindName {
  Takes takes;
  std::string_view name;
};

constexpr KindName kindNames[] = {
    {Takes::flag, "YES or NO"},   {Takes::whole, "a whole number"},
    {Takes::number, "a number"},  {Takes::state, "on, off or mixed"},
    {Takes::text, "a text"},      {Takes::window, "the name of a window"},
    {Takes::list, "a JSON list"}, {Takes::object, "a JSON object"},
    {Takes::mixed, "mixed"},      {Takes::absent, "absent"},
    {Takes::present, "present"},  {Takes::empty, "empty"},
};

/// Whether a value is an empty text, list or object.
bool isEmptyValue(const Json& value) {
  if (value.is_string()) return value.get_ref<const std::string&>().empty();
  return value.is_structured() && value.empty();
}

}  // namespace

bool Wanted::holdsFor(const std::optional<Json>& actual) const {
  switch (kind) {
    case Kind::absent:
      return !actual;
    case Kind::present:
      return actual.has_value();
    case Kind::empty:
      return actual && isEmptyValue(*actual);
    case Kind::value:
      break;
  }
  return actual && sameJson(*actual, value);
}

std::optional<Wanted> readValue(const Word& word, Takes takes) {
  if (word.kind == Word::Kind::json) {
    const auto kind = word.value.is_array() ? Takes::list : Takes::object;
    if (!includes(takes, kind)) return std::nullopt;
    return Wanted{Wanted::Kind::value, word.value};
  }
  if (word.kind == Word::Kind::bare) {
    if (auto value = readBare(word.text, takes)) return value;
  }
  if (!includes(takes, Takes::text | Takes::window)) return std::nullopt;
  return Wanted{Wanted::Kind::value, word.text};
}

std::string describe(Takes takes) {
  std::vector<std::string> names;
  for (const auto& kind : kindNames) {
    if (includes(takes, kind.takes)) names.emplace_back(kind.name);
  }
  return enumerate(names);
}

std::string show(const Wanted& wanted) {
  switch (wanted.kind) {
    case Wanted::Kind::absent:
      return "absent";
    case Wanted::Kind::present:
      return "present";
    case Wanted::Kind::empty:
      return "empty";
    case Wanted::Kind::value:
      break;
  }
  return show(wanted.value);
}

const PropertyInfo& infoNamed(const std::vector<PropertyInfo>& infos, std::string_view name) {
  const auto found = std::find_if(infos.begin(), infos.end(),
                                  [&](const PropertyInfo& info) { return info.name == name; });
  assert(found != infos.end());
  return *found;
}

std::string fullConstantName(std::string_view name) {
  constexpr std::string_view prefix = "QZ_PLIST_STATE_PARSER_";
  return std::string(name.starts_with(prefix) ? "" : prefix) + std::string(name);
}

std::string describe(const Word& word) {
  return word.kind == Word::Kind::json ? "JSON" : inQuotes(word.text);
}

}  // namespace qz::tools::scenario
