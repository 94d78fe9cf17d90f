// SPDX-License-Identifier: MIT
// Dates as the texts of property lists write them.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace toolkit {

/// A moment in ISO 8601, such as "2001-01-01T00:00:00Z", with a fraction where it has one; of a
/// moment that is infinite, no number or beyond the years that a double counts exactly, its number
/// of seconds.
std::string iso8601(double secondsSinceReferenceDate);

/// The moment that an XML property list writes as `[-]Y…-MM-DDThh:mm:ssZ`, in seconds since
/// 2001-01-01 00:00:00 UTC; nothing for any other text. A year without digits is 0. Each field
/// counts on from the ones before it: the 30th of February is the 2nd of March, the 13th month the
/// next year's first.
std::optional<double> secondsOfDate(std::string_view text);

}  // namespace toolkit
