// SPDX-License-Identifier: MIT
// The numbers that texts and reals stand for.
//
// Every function takes any input and has one answer for it. White space is what the platform skips
// before a number: U+0000 to U+0020, U+007F to U+00A0, U+2000 to U+200B and U+3000.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace toolkit {

/// White space, one sign at most, then decimal ASCII digits up to the first other character.
/// Clamped to the result's range; 0 when no digit comes first.
std::int32_t intValueOf(std::string_view text);
std::int64_t integerValueOf(std::string_view text);

/// White space, one sign at most, decimal digits with or without a point, an exponent. What follows
/// is ignored, and an exponent without digits too. Too large is infinity; 0 when no digit comes
/// first (so of `nan`, `inf` and hexadecimal numbers).
double doubleValueOf(std::string_view text);

/// White space, one sign at most, any zeros, and then `Y`, `y`, `T`, `t` or a digit from 1 to 9.
/// What follows is ignored.
bool boolValueOf(std::string_view text);

/// A real without its fraction; the nearest bound where that is out of range, 0 for no number.
std::int32_t truncatedToInt(double value);
std::int64_t truncatedToInteger(double value);

/// `text` from its first character on that is no white space.
std::string_view withoutLeadingSpace(std::string_view text);
/// The same, with white space beyond ASCII taken for other characters.
std::string_view withoutLeadingAsciiSpace(std::string_view text);

/// How many bytes at the start of `text` make up a decimal real: a sign, digits with or without a
/// point (one digit at least), an exponent that has digits. 0 when none does.
std::size_t decimalLength(std::string_view text);
/// The real that `text` stands for, all of which `decimalLength` accepts: the nearest double, or
/// infinity, or zero with the sign.
double decimalValue(std::string_view text);
/// What `nan`, and `inf` or `infinity` with or without a sign, stand for, in any case; nothing for
/// any other text.
std::optional<double> namedReal(std::string_view text);

}  // namespace toolkit
