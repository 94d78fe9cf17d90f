// SPDX-License-Identifier: MIT
// Dates as text, in the form that property lists use.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace qz::toolkit {

/// Returns a date in ISO 8601, such as "2001-01-01T00:00:00Z", with a fraction of a second if it
/// has one. For infinity, NaN and dates so far away that a double does not hold every second,
/// returns the number of seconds.
std::string iso8601(double secondsSinceReferenceDate);

/// Converts a date of an XML property list, `[-]Y…-MM-DDThh:mm:ssZ`, to seconds since 2001-01-01
/// 00:00:00 UTC; absent for any other text. A year without digits is 0. Fields may overflow into
/// the next larger one: 30 February is 2 March (1 March in a leap year), and month 13 is the next
/// January.
std::optional<double> secondsOfDate(std::string_view text);

}  // namespace qz::toolkit
