// SPDX-License-Identifier: MIT
// Compares and shows JSON in scenarios.
#pragma once

#include <nlohmann/json.hpp>

#include <optional>
#include <string>
#include <string_view>

namespace qz::tools::scenario {

/// JSON whose objects keep the order of their keys.
using Json = nlohmann::ordered_json;

/// Adds a member under a key that the object does not have yet. Assigning it would search all the
/// other members first.
void addMember(Json& object, const std::string& key, Json value);

/// Returns the JSON number that all of `text` spells; absent if it spells none.
std::optional<Json> numberIn(std::string_view text);

/// Whether two values are the same: numbers compare as numbers (60 is 60.0), objects regardless of
/// order. YES is not 1.
bool sameJson(const Json& a, const Json& b);

/// Returns where two values that are not the same first differ, such as `[0].font`; empty if they
/// differ at the root.
std::string whereDifferent(const Json& a, const Json& b);

/// Shows a value as a scenario would write it, on one line: a boolean is YES or NO unless it is in
/// a list or an object. Bytes that are not UTF-8 become U+FFFD.
std::string show(const Json& value);
/// Shows an absent value as `absent`.
std::string show(const std::optional<Json>& value);

/// Returns `text` in quotation marks, with JSON's escapes.
std::string inQuotes(std::string_view text);

}  // namespace qz::tools::scenario
