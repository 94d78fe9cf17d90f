// Dates as the texts of property lists write them.
#pragma once

#include <string>

namespace toolkit {

/// A moment in ISO 8601, such as "2001-01-01T00:00:00Z", with a fraction where it has one; of a
/// moment that is infinite, no number or beyond the years that a double counts exactly, its number
/// of seconds.
std::string iso8601(double secondsSinceReferenceDate);

}  // namespace toolkit
