// SPDX-License-Identifier: MIT
// One entry of a file that describes a window.
#include "tools/walkthrough/plist_entry.hpp"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

#include "qz/property_list/scalars.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::walkthrough {
namespace {

std::optional<std::int64_t> integerOf(const toolkit::ValueRef<>& value) {
  if (const auto text = toolkit::asString(value)) return parseNumber<std::int64_t>(text->text());
  const auto number = toolkit::asNumber(value);
  const bool isInteger = number && number->type() == toolkit::Number::Type::signedInteger;
  return isInteger ? std::optional<std::int64_t>(number->longValue()) : std::nullopt;
}

/// Reads YES or NO as property lists of any format write them.
std::optional<bool> flagOf(const toolkit::ValueRef<>& value) {
  if (const auto number = toolkit::asNumber(value)) return number->boolValue();
  const auto text = toolkit::asString(value);
  if (text->text() == "YES" || text->text() == "1") return true;
  if (text->text() == "NO" || text->text() == "0") return false;
  return std::nullopt;
}

}  // namespace

std::optional<double> numberOf(const toolkit::ValueRef<>& value) {
  std::optional<double> number;
  if (const auto text = toolkit::asString(value)) {
    number = parseNumber<double>(text->text());
  } else if (const auto stored = toolkit::asNumber(value)) {
    if (stored->type() != toolkit::Number::Type::boolean) number = stored->doubleValue();
  }
  return number && std::isfinite(*number) ? number : std::nullopt;
}

PlistEntry::PlistEntry(const InputFile& file, std::string name, const toolkit::ValueRef<>& value)
    : file_(file), name_(std::move(name)), value_(value), fields_(toolkit::asDictionary(value)) {
  if (!fields_) failAt(value_, "expected a dictionary, found " + foundWords(value));
}

bool PlistEntry::has(std::string_view key) const { return static_cast<bool>(valueOf(key)); }

void PlistEntry::expectOnly(const std::vector<std::string_view>& keys) const {
  for (const auto& [keyValue, value] : fields_->entries()) {
    const std::string key = keyValue->description();
    if (std::find(keys.begin(), keys.end(), key) != keys.end()) continue;
    std::string known;
    for (const std::string_view k : keys) known.append(known.empty() ? "" : ", ").append(k);
    failAt(keyValue, "unknown key " + quote(key) + "; expected " + known + didYouMean(key, keys));
  }
}

std::string PlistEntry::requiredText(std::string_view key) const {
  if (!toolkit::asString(valueOf(key))) fail(key, "a string");
  return text(key);
}

std::string PlistEntry::text(std::string_view key) const {
  const auto value = valueOf(key);
  if (value && !toolkit::asString(value)) fail(key, "a string");
  return std::string(toolkit::asString(value)->text());
}

std::int64_t PlistEntry::integer(std::string_view key) const {
  if (!has(key)) return 0;
  const auto number = integerOf(valueOf(key));
  if (!number) fail(key, "a whole number");
  return *number;
}

bool PlistEntry::flag(std::string_view key, bool absent) const {
  if (!has(key)) return absent;
  const auto flag = flagOf(valueOf(key));
  if (!flag) fail(key, "YES or NO");
  return *flag;
}

toolkit::Rect PlistEntry::requiredRect(std::string_view key) const {
  constexpr std::string_view expected = "four numbers (x, y, width, height)";
  const auto list = toolkit::asArray(valueOf(key));
  if (list->count() != 4) fail(key, expected);
  std::array<double, 4> numbers{};
  for (std::size_t i = 0; i < numbers.size(); ++i) {
    const auto element = list->objectAtIndex(i);
    const auto number = numberOf(element);
    const bool isLength = i >= 2;
    if (!number || (isLength && *number < 0)) {
      const std::string_view wanted = isLength ? "a number of 0 or more" : "a number";
      failAt(element, std::string(key) + "[" + std::to_string(i) + "]: expected " +
                          std::string(wanted) + ", found " + foundWords(element));
    }
    numbers.at(i) = *number;
  }
  const auto [x, y, width, height] = numbers;
  return {x, y, width, height};
}

void PlistEntry::fail(std::string_view key, std::string_view expected) const {
  const auto value = valueOf(key);
  // A missing field has no place; the message points to the entry that lacks it.
  failAt(value ? value : value_,
         std::string(key) + ": expected " + std::string(expected) + ", found " + foundWords(value));
}

toolkit::ValueRef<> PlistEntry::valueOf(std::string_view key) const {
  return fields_->objectForKey(key);
}

void PlistEntry::failAt(const toolkit::ValueRef<>& value, const std::string& message) const {
  file_.fail(value, name_ + ": " + message);
}

}  // namespace qz::tools::walkthrough
