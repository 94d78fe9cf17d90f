// SPDX-License-Identifier: MIT
// JSON in scenarios: how it is compared and how it is shown.
#pragma once

#include <nlohmann/json.hpp>

#include <optional>
#include <string>
#include <string_view>

namespace tools::scenario {

/// JSON whose objects keep the order in which their keys stand.
using Json = nlohmann::ordered_json;

/// Adds a member under a key that the object does not have yet: setting one would look through all
/// the others first.
void addMember(Json& object, const std::string& key, Json value);

/// The JSON number that `text` is as a whole, or nothing.
std::optional<Json> numberIn(std::string_view text);

/// Whether two values are the same: numbers compare as numbers (60 is 60.0), objects without regard
/// to order. YES is not 1.
bool sameJson(const Json& a, const Json& b);

/// Where two values that are not the same first differ, such as `[0].font`; empty when it is at
/// their root.
std::string whereDifferent(const Json& a, const Json& b);

/// A value as a scenario would write it, on one line: a boolean is YES or NO unless it stands
/// within a list or an object. Bytes that are no UTF-8 show as U+FFFD.
std::string show(const Json& value);
/// Nothing shows as `absent`.
std::string show(const std::optional<Json>& value);

/// `text` in quotation marks, with JSON's escapes.
std::string inQuotes(std::string_view text);

}  // namespace tools::scenario
