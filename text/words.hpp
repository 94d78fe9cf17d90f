// SPDX-License-Identifier: MIT
// Eight characters at a time, in one 64-bit word.
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace qz::text::words {

constexpr std::size_t size = sizeof(std::uint64_t);
constexpr std::uint64_t ones = 0x0101010101010101;
constexpr std::uint64_t highBits = 0x80 * ones;

/// Returns the word that starts at `characters`, which must have at least eight characters.
inline std::uint64_t load(const char* characters) {
  std::uint64_t word = 0;
  std::memcpy(&word, characters, sizeof word);
  return word;
}

/// Returns the number that a word represents in big-endian order.
inline std::uint64_t bigEndian(std::uint64_t word) {
  if constexpr (std::endian::native == std::endian::big) return word;
  // Swaps neighbouring bytes, then pairs, then halves; compiles to one instruction.
  word = (word & 0x00FF00FF00FF00FF) << 8 | (word >> 8 & 0x00FF00FF00FF00FF);
  word = (word & 0x0000FFFF0000FFFF) << 16 | (word >> 16 & 0x0000FFFF0000FFFF);
  return word << 32 | word >> 32;
}

/// Returns a word with the high bit set in each byte that is zero in `word`, and all other bits
/// clear.
inline std::uint64_t zeroBytes(std::uint64_t word) {
  return ~(((word & ~highBits) + ~highBits) | word | ~highBits);
}

/// The same for each byte that equals `c`.
inline std::uint64_t bytesThatAre(char c, std::uint64_t word) {
  return zeroBytes(word ^ (ones * static_cast<unsigned char>(c)));
}

/// Returns the number of characters before the first marked one. `marks` has no bits other than
/// high bits.
inline std::size_t charactersBefore(std::uint64_t marks) {
  const bool firstIsLowest = std::endian::native == std::endian::little;
  return static_cast<std::size_t>(firstIsLowest ? std::countr_zero(marks)
                                                : std::countl_zero(marks)) /
         8;
}

}  // namespace qz::text::words
