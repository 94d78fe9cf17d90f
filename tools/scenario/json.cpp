// SPDX-License-Identifier: MIT
// Compares and shows JSON in scenarios.

#include "tools/scenario/json.hpp"

#include <algorithm>
#include <map>
#include <utility>

namespace qz::tools::scenario {
namespace {

bool isInteger(const Json& value) { return value.is_number_integer(); }

// Compares integers as integers: as floating-point numbers, large neighbours would be equal.
bool sameNumber(const Json& a, const Json& b) {
  if (!isInteger(a) || !isInteger(b)) return a.get<double>() == b.get<double>();
  if (a.is_number_unsigned() != b.is_number_unsigned()) {
    const Json& withoutSign = a.is_number_unsigned() ? a : b;
    const Json& withSign = a.is_number_unsigned() ? b : a;
    return std::cmp_equal(withoutSign.get<std::uint64_t>(), withSign.get<std::int64_t>());
  }
  return a.get<std::uint64_t>() == b.get<std::uint64_t>();
}

bool sameObject(const Json& a, const Json& b) {
  if (a.size() != b.size()) return false;
  // An index, because a look-up by key in the object itself walks all of its keys.
  std::map<std::string_view, const Json*> index;
  for (const auto& [key, value] : b.items()) index.emplace(key, &value);
  return std::all_of(a.items().begin(), a.items().end(), [&](const auto& item) {
    const auto found = index.find(item.key());
    return found != index.end() && sameJson(item.value(), *found->second);
  });
}

}  // namespace

void addMember(Json& object, const std::string& key, Json value) {
  object.get_ref<Json::object_t&>().emplace_back(key, std::move(value));
}

std::optional<Json> numberIn(std::string_view text) {
  auto value = Json::parse(text, nullptr, false);
  if (!value.is_number()) return std::nullopt;
  return value;
}

bool sameJson(const Json& a, const Json& b) {
  if (a.is_number() && b.is_number()) return sameNumber(a, b);
  if (a.is_object() && b.is_object()) return sameObject(a, b);
  if (a.is_array() && b.is_array()) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(), sameJson);
  }
  return a == b;
}

std::string whereDifferent(const Json& a, const Json& b) {
  if (a.is_array() && b.is_array()) {
    const auto both = std::min(a.size(), b.size());
    std::size_t i = 0;
    while (i < both && sameJson(a[i], b[i])) ++i;
    return "[" + std::to_string(i) + "]" + (i < both ? whereDifferent(a[i], b[i]) : "");
  }
  if (!a.is_object() || !b.is_object()) return "";
  for (const auto& [key, value] : a.items()) {
    const auto other = b.find(key);
    if (other == b.end()) return "." + key;
    if (!sameJson(value, *other)) return "." + key + whereDifferent(value, *other);
  }
  // Every member of `a` is the same in `b`, so `b` has a key that `a` lacks.
  const auto more =
      std::ranges::find_if(b.items(), [&](const auto& item) { return !a.contains(item.key()); });
  return "." + more.key();
}

std::string show(const Json& value) {
  if (value.is_boolean()) return value.get<bool>() ? "YES" : "NO";
  return value.dump(-1, ' ', false, Json::error_handler_t::replace);
}

std::string show(const std::optional<Json>& value) { return value ? show(*value) : "absent"; }

std::string inQuotes(std::string_view text) { return show(Json(text)); }

}  // namespace qz::tools::scenario
