// SPDX-License-Identifier: MIT
#include "toolkit/property_list/calendar.hpp"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstdio>

#include "text/ascii.hpp"

namespace qz::toolkit {
namespace {

constexpr double secondsPerDay = 86400;
constexpr std::int64_t daysPerEra = 146097;    // 400 years
constexpr std::int64_t referenceDay = 730791;  // 2001-01-01, counted from 0000-03-01
// Later years count as this one: a double of seconds cannot distinguish days that far away.
constexpr std::int64_t latestYear = 1'000'000'000'000;
constexpr double exactSeconds = 9007199254740992.0;  // 2^53: a double holds all integers to here

bool isLeap(std::int64_t year) { return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0); }

std::int64_t floorDivide(std::int64_t a, std::int64_t b) { return (a >= 0 ? a : a - (b - 1)) / b; }

/// Returns the number of days from 2001-01-01 to the first day of `year`.
std::int64_t daysBeforeYear(std::int64_t year) {
  const std::int64_t past = year - 1;
  return 365 * (year - 2001) + floorDivide(past, 4) - floorDivide(past, 100) +
         floorDivide(past, 400) - 485;
}

/// The platform uses a table of sixteen months, the first and the last two of which are empty; a
/// month beyond the table counts as 65535 days.
std::int64_t daysBeforeMonth(int month, bool leap) {
  constexpr std::array<int, 16> days = {0,   0,   31,  59,  90,  120, 151, 181,
                                        212, 243, 273, 304, 334, 365, 0,   0};
  if (month >= static_cast<int>(days.size())) return 65535;
  return days[static_cast<std::size_t>(month)] + (month > 2 && leap ? 1 : 0);
}

std::string shortest(double number) {
  std::array<char, 32> buffer;
  const auto [end, error] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
  return {buffer.data(), end};
}

}  // namespace

std::string iso8601(double secondsSinceReferenceDate) {
  if (!(std::abs(secondsSinceReferenceDate) < exactSeconds)) {
    return shortest(secondsSinceReferenceDate);
  }
  const double whole = std::floor(secondsSinceReferenceDate);
  const double dayStart = std::floor(whole / secondsPerDay);
  const auto second = static_cast<std::int64_t>(whole - dayStart * secondsPerDay);
  // A year counted from March ends with its leap day, which keeps the months' lengths regular.
  const std::int64_t day = static_cast<std::int64_t>(dayStart) + referenceDay;
  const std::int64_t era = (day >= 0 ? day : day - (daysPerEra - 1)) / daysPerEra;
  const std::int64_t dayOfEra = day - era * daysPerEra;
  const std::int64_t yearOfEra =
      (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
  const std::int64_t dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
  const std::int64_t marchMonth = (5 * dayOfYear + 2) / 153;
  const std::int64_t dayOfMonth = dayOfYear - (153 * marchMonth + 2) / 5 + 1;
  const std::int64_t month = marchMonth < 10 ? marchMonth + 3 : marchMonth - 9;
  const std::int64_t year = era * 400 + yearOfEra + (month <= 2 ? 1 : 0);
  std::array<char, 96> text;
  std::snprintf(text.data(), text.size(), "%s%04lld-%02d-%02dT%02d:%02d:%02d", year < 0 ? "-" : "",
                static_cast<long long>(year < 0 ? -year : year), static_cast<int>(month),
                static_cast<int>(dayOfMonth), static_cast<int>(second / 3600),
                static_cast<int>(second / 60 % 60), static_cast<int>(second % 60));
  const double fraction = secondsSinceReferenceDate - whole;
  // The fraction's own digits, without the 0 before the point.
  return text.data() + (fraction > 0 ? shortest(fraction).substr(1) : "") + "Z";
}

std::optional<double> secondsOfDate(std::string_view text) {
  const bool negative = text.starts_with('-');
  if (negative) text.remove_prefix(1);
  std::int64_t year = 0;
  std::size_t digits = 0;
  for (; digits < text.size() && text::isDigit(text[digits]); ++digits) {
    year = std::min(year * 10 + (text[digits] - '0'), latestYear);
  }
  text.remove_prefix(digits);
  constexpr std::string_view pattern = "-00-00T00:00:00Z";
  if (text.size() != pattern.size()) return std::nullopt;
  std::array<int, 5> fields{};
  std::size_t seen = 0;
  for (std::size_t i = 0; i < pattern.size(); ++i) {
    if (pattern[i] != '0' ? text[i] != pattern[i] : !text::isDigit(text[i])) return std::nullopt;
    if (pattern[i] == '0') fields[seen / 2] = fields[seen / 2] * 10 + (text[i] - '0');
    if (pattern[i] == '0') ++seen;
  }
  if (negative) year = -year;
  const auto [month, day, hour, minute, second] = fields;
  const std::int64_t days = daysBeforeYear(year) + daysBeforeMonth(month, isLeap(year)) + day - 1;
  return static_cast<double>(days) * secondsPerDay + hour * 3600.0 + minute * 60.0 + second;
}

}  // namespace qz::toolkit
