// SPDX-License-Identifier: MIT
// The layout of binary property lists: trailer, object markers, numbers. All numbers are
// big-endian.
//
//   "bplist0?"  objects …  offset table (one offset per object)  trailer (32 bytes)
//
// An object consists of a marker byte and its content. The high half of the marker gives the kind,
// the low half the length; a length that does not fit follows the marker as an integer object.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "text/words.hpp"

namespace qz::toolkit::binary {

constexpr std::string_view magic = "bplist0";  // the version's second digit may be any byte
constexpr std::size_t headerSize = 8;

enum class Marker : std::uint8_t {
  null = 0x00,
  no = 0x08,
  yes = 0x09,
  integer = 0x10,  // 2^low bytes
  real = 0x20,     // 2^low bytes
  date = 0x33,     // a real of 8 bytes
  data = 0x40,
  ascii = 0x50,
  utf16 = 0x60,
  uid = 0x80,  // low + 1 bytes
  array = 0xA0,
  set = 0xC0,
  dictionary = 0xD0
};

/// In the low half of a marker: the length follows the marker.
constexpr unsigned longLength = 15;

struct Trailer {
  static constexpr std::size_t size = 32;  // the first six bytes have no meaning
  std::uint8_t offsetSize;
  std::uint8_t referenceSize;
  std::uint64_t objectCount;
  std::uint64_t topObject;
  std::uint64_t tableOffset;
};

/// An array of numbers of one size.
class Numbers {
 public:
  /// `size` is in bytes per number, at least 1.
  explicit Numbers(std::size_t size)
      : size_(size),
        mask_(~std::uint64_t{0} >> (8 * (text::words::size - std::min(size, text::words::size)))) {}

  std::size_t size() const { return size_; }
  /// Returns the low 64 bits of the number at `index` in the array at `first`. The array must
  /// follow a file's header, because the function reads the eight bytes up to the number's end.
  std::uint64_t at(const char* first, std::size_t index) const {
    return text::words::bigEndian(
               text::words::load(first + (index + 1) * size_ - text::words::size)) &
           mask_;
  }

 private:
  std::size_t size_;
  std::uint64_t mask_;
};

/// Returns the number that fills all of `bytes`, by the same rules.
inline std::uint64_t number(std::string_view bytes) {
  return Numbers(bytes.size()).at(bytes.data(), 0);
}

inline void appendNumber(std::string& bytes, std::uint64_t number, std::size_t size) {
  for (std::size_t left = size; left-- > 0;) {
    bytes += left < sizeof number ? static_cast<char>(number >> (8 * left)) : '\0';
  }
}

}  // namespace qz::toolkit::binary
