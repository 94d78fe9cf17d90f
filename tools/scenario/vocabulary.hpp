// SPDX-License-Identifier: MIT
// What the parser knows about the language: the forms of its statements, the properties that they
// can name, and the values that these accept. Nothing here says what a statement does.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/json.hpp"
#include "tools/scenario/lexer.hpp"

namespace qz::tools::scenario {

/// What may follow the `=>` of a statement.
enum class Result {
  never,    ///< it has no `=>`
  nothing,  ///< only `raises`
  flag,     ///< YES, NO or `raises`
  control,  ///< a control, `none` or `raises`
};

/// How a statement is written. In `syntax`, words in lower case are literal and words in capitals
/// are slots (see slots.cpp); `a|B` is one or the other, `[...]` is optional, `A...` takes all
/// remaining words.
struct Form {
  std::string_view syntax;
  Result result = Result::never;
};

/// The kinds of value that a place accepts; they can be combined.
enum class Takes : unsigned {
  nothing = 0,
  flag = 1U << 0U,      ///< YES, NO
  whole = 1U << 1U,     ///< a number without a fraction
  number = 1U << 2U,    ///< any number
  text = 1U << 3U,      ///< any word, also 5 and YES
  list = 1U << 4U,      ///< a JSON list
  object = 1U << 5U,    ///< a JSON object
  window = 1U << 6U,    ///< the name of a window
  state = 1U << 7U,     ///< on, off or mixed, for 1, 0 and -1
  mixed = 1U << 8U,     ///< mixed
  absent = 1U << 9U,    ///< absent
  present = 1U << 10U,  ///< present
  empty = 1U << 11U,    ///< empty
};
constexpr Takes operator|(Takes a, Takes b) {
  return static_cast<Takes>(static_cast<unsigned>(a) | static_cast<unsigned>(b));
}
constexpr bool includes(Takes all, Takes some) {
  return (static_cast<unsigned>(all) & static_cast<unsigned>(some)) != 0;
}

inline constexpr Takes anyJson =
    Takes::flag | Takes::number | Takes::text | Takes::list | Takes::object;

inline constexpr Takes anyExpectation = anyJson | Takes::absent | Takes::present | Takes::empty;

/// A value as it is written in a scenario.
struct Wanted {
  enum class Kind { value, absent, present, empty };

  Kind kind = Kind::value;
  Json value;

  /// Whether `actual`, which may be absent, is what is wanted. `empty` means an empty list, object
  /// or text.
  bool holdsFor(const std::optional<Json>& actual) const;
};

/// Reads `word` as a value of one of the kinds; absent if it is none. If both are accepted, a bare
/// number is a number, not a text.
std::optional<Wanted> readValue(const Word& word, Takes takes);
/// Describes the kinds in words, such as `YES or NO`.
std::string describe(Takes takes);
/// Shows the wanted value as a scenario writes it.
std::string show(const Wanted& wanted);

/// A property that can follow a name, as in `NAME.PROPERTY`.
struct PropertyInfo {
  std::string_view name;
  Takes read = Takes::nothing;     ///< the values that can be expected
  Takes written = Takes::nothing;  ///< the values that it can be set to
  bool namesClasses = false;       ///< its texts are names of classes
};

/// Returns the property with this name. An unknown name is a programming error.
const PropertyInfo& infoNamed(const std::vector<PropertyInfo>& infos, std::string_view name);

struct Vocabulary {
  std::vector<Form> forms;
  std::vector<PropertyInfo> engine;
  std::vector<PropertyInfo> control;
  std::vector<PropertyInfo> window;
  std::vector<std::string_view> constants;  ///< the exported command names
};

/// Returns the constant's whole name; `name` may leave its prefix out.
std::string fullConstantName(std::string_view name);

/// Returns the word as messages show it: in quotation marks, or `JSON`.
std::string describe(const Word& word);

}  // namespace qz::tools::scenario
