// SPDX-License-Identifier: MIT
// Helpers for the words of HTML and CSS: ASCII letters regardless of case, numbers regardless of
// locale.
#pragma once

#include <charconv>
#include <cmath>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "text/ascii.hpp"
#include "text/number_conversion.hpp"

namespace qz::toolkit::html {

/// True for HTML's white space.
constexpr bool isSpace(char c) {
  return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f';
}

using text::isLetter;

constexpr std::string_view trimmed(std::string_view text) {
  while (!text.empty() && isSpace(text.front())) text.remove_prefix(1);
  while (!text.empty() && isSpace(text.back())) text.remove_suffix(1);
  return text;
}

/// Cuts off and returns the text before the first `separator`, or all of it if there is none.
constexpr std::string_view takeUntil(std::string_view& text, char separator) {
  const std::size_t end = text.find(separator);
  const std::string_view part = text.substr(0, end);
  text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
  return part;
}

/// Cuts off the first word and the white space around it, and returns the word.
constexpr std::string_view takeWord(std::string_view& text) {
  text = trimmed(text);
  std::size_t end = 0;
  while (end < text.size() && !isSpace(text[end])) ++end;
  const std::string_view word = text.substr(0, end);
  text = trimmed(text.substr(end));
  return word;
}

/// Cuts off and returns the decimal number at the start of `text`, as in "-1.5em".
inline std::optional<double> takeNumber(std::string_view& text) {
  const std::size_t length = text::fixedDecimalLength(text);
  const double number = text::decimalValue(text.substr(0, length));
  if (length == 0 || std::isinf(number)) return std::nullopt;
  text.remove_prefix(length);
  return number;
}

/// Returns the integer at the start of an attribute's value; absent if there is none or it exceeds
/// 32 bits.
inline std::optional<std::int32_t> leadingInteger(std::string_view text) {
  text = trimmed(text);
  if (text.starts_with('+')) text.remove_prefix(1);
  std::int32_t number = 0;
  const auto error = std::from_chars(text.data(), text.data() + text.size(), number).ec;
  return error == std::errc() ? std::optional(number) : std::nullopt;
}

}  // namespace qz::toolkit::html
