// The layout of binary property lists: trailer, object markers, numbers. All numbers are
// big-endian.
//
//   "bplist0?"  objects …  offset table (one offset an object)  trailer (32 bytes)
//
// An object is a marker byte, whose high half says what it is and whose low half how long, and its
// content; a length that does not fit stands as an integer object behind the marker.
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace toolkit::binary {

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

/// In the low half of a marker: the length stands behind.
constexpr unsigned longLength = 15;

struct Trailer {
  static constexpr std::size_t size = 32;  // the first six bytes mean nothing
  std::uint8_t offsetSize;
  std::uint8_t referenceSize;
  std::uint64_t objectCount;
  std::uint64_t topObject;
  std::uint64_t tableOffset;
};

/// The low 64 bits of a number that takes all of `bytes`.
inline std::uint64_t number(std::string_view bytes) {
  std::uint64_t result = 0;
  for (const char byte : bytes) result = (result << 8) | static_cast<unsigned char>(byte);
  return result;
}

inline void appendNumber(std::string& bytes, std::uint64_t number, std::size_t size) {
  for (std::size_t left = size; left-- > 0;) {
    bytes += left < sizeof number ? static_cast<char>(number >> (8 * left)) : '\0';
  }
}

}  // namespace toolkit::binary
