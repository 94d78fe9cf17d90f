#include "toolkit/property_list/calendar.hpp"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstdio>

namespace toolkit {
namespace {

constexpr double secondsPerDay = 86400;
constexpr std::int64_t daysPerEra = 146097;          // 400 years
constexpr std::int64_t referenceDay = 730791;        // 2001-01-01, counted from 0000-03-01
constexpr double exactSeconds = 9007199254740992.0;  // 2^53: up to here a double counts by ones

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

}  // namespace toolkit
