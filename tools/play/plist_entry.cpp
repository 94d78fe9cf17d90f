// One entry of a file that describes a window.
#include "tools/play/plist_entry.hpp"

#include <algorithm>
#include <array>
#include <cmath>

#include "toolkit/property_list/scalars.hpp"
#include "tools/failure.hpp"
#include "tools/play/input_file.hpp"
#include "tools/play/text_layout.hpp"
#include "tools/play/whole_number.hpp"
#include "tools/scenario/near_miss.hpp"

namespace tools::play {
namespace {

std::optional<long> integerOf(const toolkit::ValueRef<>& value) {
  if (const auto text = toolkit::asString(value)) return wholeNumber<long>(text->text());
  const auto number = toolkit::asNumber(value);
  const bool isInteger = number && number->type() == toolkit::Number::Type::signedInteger;
  return isInteger ? std::optional<long>(number->longValue()) : std::nullopt;
}

/// YES and NO as property lists of all formats write them.
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
    number = wholeNumber<double>(text->text());
  } else if (const auto stored = toolkit::asNumber(value)) {
    if (stored->type() != toolkit::Number::Type::boolean) number = stored->doubleValue();
  }
  return number && std::isfinite(*number) ? number : std::nullopt;
}

PlistEntry::PlistEntry(std::string_view file, std::string_view name,
                       const toolkit::ValueRef<>& value)
    : where_(std::string(file) + ": " + std::string(name)), fields_(toolkit::asDictionary(value)) {
  if (!fields_) failWith(": expected a dictionary, found " + foundWords(value));
}

bool PlistEntry::has(std::string_view key) const { return static_cast<bool>(valueOf(key)); }

void PlistEntry::expectOnly(const std::vector<std::string_view>& keys) const {
  for (const std::string& key : fields_->allKeys()) {
    if (std::find(keys.begin(), keys.end(), key) != keys.end()) continue;
    std::string known;
    for (const std::string_view k : keys) known.append(known.empty() ? "" : ", ").append(k);
    failWith(": unknown key " + quote(key) + "; expected " + known +
             scenario::didYouMean(key, keys));
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

long PlistEntry::integer(std::string_view key) const {
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
    const auto number = numberOf(list->objectAtIndex(i));
    if (!number) {
      const std::string place = std::string(key) + "[" + std::to_string(i) + "]";
      failWith(": " + place + ": expected a number, found " + foundWords(list->objectAtIndex(i)));
    }
    numbers.at(i) = *number;
  }
  const auto [x, y, width, height] = numbers;
  if (width < 0 || height < 0) fail(key, "a width and a height of 0 or more");
  return {x, y, width, height};
}

void PlistEntry::fail(std::string_view key, std::string_view expected) const {
  failWith(": " + std::string(key) + ": expected " + std::string(expected) + ", found " +
           foundWords(valueOf(key)));
}

toolkit::ValueRef<> PlistEntry::valueOf(std::string_view key) const {
  return fields_->objectForKey(key);
}

void PlistEntry::failWith(const std::string& message) const {
  throw Failure(ExitStatus::badInput, where_ + message);
}

}  // namespace tools::play
