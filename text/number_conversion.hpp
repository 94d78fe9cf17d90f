// SPDX-License-Identifier: MIT
// Conversion of texts and reals to numbers.
//
// Every function accepts any input. White space means the characters that the platform skips before
// a number: U+0000 to U+0020, U+007F to U+00A0, U+2000 to U+200B and U+3000.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace qz::text {

/// Read white space, an optional sign and decimal ASCII digits; the rest is ignored. The result is
/// clamped to its range, and 0 if there is no digit.
std::int32_t intValueOf(std::string_view text);
std::int64_t integerValueOf(std::string_view text);

/// Reads white space, an optional sign, decimal digits with or without a point, and an optional
/// exponent. The rest is ignored, including an exponent without digits. Too large a number gives
/// infinity; no digit gives 0 (as for `nan` and `inf`).
double doubleValueOf(std::string_view text);

/// True if `text` starts with white space, an optional sign and any zeros, followed by `Y`, `y`,
/// `T`, `t` or a digit from 1 to 9. The rest is ignored.
bool boolValueOf(std::string_view text);

/// Return a real without its fraction; the nearest bound if it is out of range, 0 for NaN.
std::int32_t truncatedToInt(double value);
std::int64_t truncatedToInteger(double value);

/// Returns `text` from its first character that is not white space.
std::string_view withoutLeadingSpace(std::string_view text);
/// The same, but skips only ASCII white space.
std::string_view withoutLeadingAsciiSpace(std::string_view text);

/// Returns the length in bytes of the decimal real at the start of `text`: an optional sign, digits
/// with or without a point (at least one digit) and an optional exponent with digits. 0 if there is
/// none.
std::size_t decimalLength(std::string_view text);
/// The same without an exponent.
std::size_t fixedDecimalLength(std::string_view text);
/// Converts `text`, all of which `decimalLength` must accept, to the nearest double; infinity if it
/// is too large. Zero keeps its sign.
double decimalValue(std::string_view text);
/// Converts `nan`, and `inf` or `infinity` with an optional sign, in upper or lower case; absent
/// for any other text.
std::optional<double> namedReal(std::string_view text);

}  // namespace qz::text
