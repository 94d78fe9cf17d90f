// SPDX-License-Identifier: MIT
// Checks number conversion against the C library's results for the same texts.
#include "text/number_conversion.hpp"

#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string>
#include <string_view>

#include "fuzz/require.hpp"

namespace qz {

namespace {

using fuzz::require;

void checkIntegers(std::string_view text) {
  const std::string bare(text::withoutLeadingSpace(text));
  const std::int64_t expected = std::strtoll(bare.c_str(), nullptr, 10);
  const std::int64_t integer = text::integerValueOf(text);
  require(integer == expected,
          "the integer is " + std::to_string(expected) + ", not " + std::to_string(integer));
  const auto clamped = std::clamp<std::int64_t>(integer, std::numeric_limits<std::int32_t>::min(),
                                                std::numeric_limits<std::int32_t>::max());
  require(text::intValueOf(text) == clamped, "32 bits are the same, clamped");
  if (integer != 0) require(text::boolValueOf(text), "other than zero is true");
}

void checkReals(std::string_view text) {
  const std::string_view bare = text::withoutLeadingSpace(text);
  const std::string decimal(bare.substr(0, text::decimalLength(bare)));
  char* end = nullptr;
  const double expected = std::strtod(decimal.c_str(), &end);
  require(end == decimal.c_str() + decimal.size(), "a decimal real is one from end to end");
  const double real = text::doubleValueOf(text);
  require(std::bit_cast<std::uint64_t>(real) == std::bit_cast<std::uint64_t>(expected),
          "the real is " + std::to_string(expected) + ", not " + std::to_string(real));
  if (text::namedReal(bare)) require(decimal.empty(), "a name is not a decimal real");
}

void checkTruncation(std::string_view text) {
  double real = 0;
  std::memcpy(&real, text.data(), std::min(text.size(), sizeof real));
  const std::int64_t integer = text::truncatedToInteger(real);
  if (std::isnan(real)) {
    require(integer == 0 && text::truncatedToInt(real) == 0, "no number is 0");
  } else if (std::abs(real) < 0x1p63) {
    require(static_cast<double>(integer) == std::trunc(real), "a real loses its fraction");
  } else {
    require((integer < 0) == (real < 0) && std::abs(static_cast<double>(integer)) == 0x1p63,
            "a real out of range is the nearest bound");
  }
}

}  // namespace

}  // namespace qz

using namespace qz;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  checkIntegers(text);
  checkReals(text);
  checkTruncation(text);
  return 0;
}
