// SPDX-License-Identifier: MIT
#include "text/number_conversion.hpp"

#include <algorithm>
#include <charconv>
#include <limits>
#include <locale>
#include <sstream>
#include <string>
#include <system_error>

#include "text/ascii.hpp"

namespace qz::text {
namespace {

constexpr std::size_t longestRealName = 9;  // "-infinity"

bool isSign(char c) { return c == '+' || c == '-'; }

std::size_t digitCount(std::string_view text) {
  const auto end = std::find_if_not(text.begin(), text.end(), isDigit);
  return static_cast<std::size_t>(end - text.begin());
}

bool isAsciiSpace(unsigned char c) { return c <= 0x20 || c == 0x7F; }

/// Returns the length in bytes of the white space character at the start of `text`, or 0.
std::size_t spaceLength(std::string_view text) {
  const auto at = [&](std::size_t i) {
    return i < text.size() ? static_cast<unsigned char>(text[i]) : 0xFFU;
  };
  if (text.empty()) return 0;
  if (isAsciiSpace(static_cast<unsigned char>(text[0]))) return 1;
  if (at(0) == 0xC2 && at(1) >= 0x80 && at(1) <= 0xA0) return 2;
  if (at(0) == 0xE2 && at(1) == 0x80 && at(2) >= 0x80 && at(2) <= 0x8B) return 3;
  if (at(0) == 0xE3 && at(1) == 0x80 && at(2) == 0x80) return 3;
  return 0;
}

/// Returns the integer at the start of `text`, clamped to the range of Integer.
template <class Integer>
Integer leadingInteger(std::string_view text) {
  text = withoutLeadingSpace(text);
  const bool negative = text.starts_with('-');
  if (!text.empty() && isSign(text.front())) text.remove_prefix(1);
  const std::string_view digits = text.substr(0, digitCount(text));
  // Accumulated as a negative number, because the negative range is larger by one.
  constexpr Integer lowest = std::numeric_limits<Integer>::min();
  Integer below = 0;
  for (const char c : digits) {
    const auto digit = static_cast<Integer>(c - '0');
    if (below < lowest / 10 || below * 10 < lowest + digit) {
      return negative ? lowest : std::numeric_limits<Integer>::max();
    }
    below = static_cast<Integer>(below * 10 - digit);
  }
  if (negative) return below;
  return below == lowest ? std::numeric_limits<Integer>::max() : static_cast<Integer>(-below);
}

template <class Integer>
Integer truncated(double value) {
  constexpr auto lowest = std::numeric_limits<Integer>::min();
  constexpr auto bound = -static_cast<double>(lowest);  // one above the maximum; exact as a double
  if (!(value > -bound - 1)) return value == value ? lowest : 0;
  return value < bound ? static_cast<Integer>(value) : std::numeric_limits<Integer>::max();
}

/// Whether a decimal real that does not fit in a double is too large rather than too small.
[[maybe_unused]] bool isHuge(std::string_view unsignedDecimal) {
  const std::size_t mantissa = unsignedDecimal.find_first_of("eE");
  const bool negativeExponent =
      mantissa != std::string_view::npos && unsignedDecimal.substr(mantissa + 1).starts_with('-');
  std::int64_t exponent =
      mantissa == std::string_view::npos ? 0 : integerValueOf(unsignedDecimal.substr(mantissa + 1));
  // A clamped exponent outweighs any number of digits that fits in memory.
  if (exponent > INT64_MAX / 2 || exponent < INT64_MIN / 2) return !negativeExponent;
  const std::string_view digits = unsignedDecimal.substr(0, mantissa);
  const std::size_t point = std::min(digits.find('.'), digits.size());
  const std::size_t first = digits.find_first_of("123456789");
  if (first == std::string_view::npos) return false;
  exponent += static_cast<std::int64_t>(point) - static_cast<std::int64_t>(first);
  return exponent > 0;
}

double unsignedDecimalValue(std::string_view text) {
  double value = 0;
#if defined(__cpp_lib_to_chars)
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
  if (error != std::errc::result_out_of_range) return value;
  return isHuge(text) ? std::numeric_limits<double>::infinity() : 0;
#else
  // libc++ before version 20 has no such function for reals. This one sets infinity or 0 by itself.
  std::istringstream stream{std::string(text)};
  stream.imbue(std::locale::classic());
  stream >> value;
  return value;
#endif
}

}  // namespace

std::int32_t intValueOf(std::string_view text) { return leadingInteger<std::int32_t>(text); }
std::int64_t integerValueOf(std::string_view text) { return leadingInteger<std::int64_t>(text); }

double doubleValueOf(std::string_view text) {
  text = withoutLeadingSpace(text);
  return decimalValue(text.substr(0, decimalLength(text)));
}

bool boolValueOf(std::string_view text) {
  text = withoutLeadingSpace(text);
  if (!text.empty() && isSign(text.front())) text.remove_prefix(1);
  const std::size_t first = text.find_first_not_of('0');
  // A letter, too, may follow a sign and zeros: "+Y" is true.
  return first != std::string_view::npos &&
         std::string_view("YyTt123456789").find(text[first]) != std::string_view::npos;
}

std::int32_t truncatedToInt(double value) { return truncated<std::int32_t>(value); }
std::int64_t truncatedToInteger(double value) { return truncated<std::int64_t>(value); }

std::string_view withoutLeadingSpace(std::string_view text) {
  while (const std::size_t length = spaceLength(text)) text.remove_prefix(length);
  return text;
}

std::string_view withoutLeadingAsciiSpace(std::string_view text) {
  while (!text.empty() && isAsciiSpace(static_cast<unsigned char>(text[0]))) text.remove_prefix(1);
  return text;
}

std::size_t fixedDecimalLength(std::string_view text) {
  const std::size_t sign = !text.empty() && isSign(text.front()) ? 1 : 0;
  const std::size_t whole = digitCount(text.substr(sign));
  const std::string_view rest = text.substr(sign + whole);
  const std::size_t fraction = rest.starts_with('.') ? digitCount(rest.substr(1)) : 0;
  if (whole + fraction == 0) return 0;
  return sign + whole + (rest.starts_with('.') ? 1 + fraction : 0);
}

std::size_t decimalLength(std::string_view text) {
  const std::size_t at = fixedDecimalLength(text);
  if (at == 0 || at == text.size() || (text[at] != 'e' && text[at] != 'E')) return at;
  std::size_t exponent = at + 1;
  if (exponent < text.size() && isSign(text[exponent])) ++exponent;
  const std::size_t digits = digitCount(text.substr(exponent));
  return digits == 0 ? at : exponent + digits;
}

double decimalValue(std::string_view text) {
  const bool negative = text.starts_with('-');
  if (!text.empty() && isSign(text.front())) text.remove_prefix(1);
  const double value = unsignedDecimalValue(text);
  return negative ? -value : value;
}

std::optional<double> namedReal(std::string_view text) {
  std::string name(text.substr(0, longestRealName + 1));
  for (char& c : name) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c | 0x20) : c;
  if (name == "nan") return std::numeric_limits<double>::quiet_NaN();
  const bool negative = name.starts_with('-');
  if (!name.empty() && isSign(name.front())) name.erase(0, 1);
  if (name != "inf" && name != "infinity") return std::nullopt;
  const double infinity = std::numeric_limits<double>::infinity();
  return negative ? -infinity : infinity;
}

}  // namespace qz::text
