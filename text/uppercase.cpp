// SPDX-License-Identifier: MIT
#include "text/uppercase.hpp"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <iterator>

#include "text/utf8.hpp"
#include "text/words.hpp"

namespace qz::text {

namespace {

// The letters first, first + step, …, last; the upper-case form of each is `distance` code points
// further on.
struct Range {
  char32_t first;
  char32_t last;
  char32_t step;
  int distance;
};

// A letter whose upper case consists of several characters, as UTF-8.
struct Expansion {
  char32_t letter;
  std::string_view upper;
};

#include "text/uppercase_table.inc"

struct Decoded {
  char32_t character;
  std::size_t length;  // bytes; 0 if the bytes are not UTF-8
};

Decoded decode(std::string_view text) {
  const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
  const std::size_t length = byte(0) >= 0xF0 ? 4 : byte(0) >= 0xE0 ? 3 : byte(0) >= 0xC2 ? 2 : 0;
  if (length == 0 || length > text.size()) return {0, 0};
  char32_t character = byte(0) & (0xFFU >> (length + 1));
  for (std::size_t i = 1; i < length; ++i) {
    if ((byte(i) & 0xC0) != 0x80) return {0, 0};
    character = (character << 6) | (byte(i) & 0x3FU);
  }
  return {character, length};
}

char32_t simpleUpper(char32_t c) {
  const auto* range = std::lower_bound(std::begin(ranges), std::end(ranges), c,
                                       [](const Range& r, char32_t x) { return r.last < x; });
  if (range == std::end(ranges) || c < range->first) return c;
  if ((c - range->first) % range->step != 0) return c;
  return static_cast<char32_t>(static_cast<int>(c) + range->distance);
}

void appendUpper(std::string& out, char32_t c) {
  const auto* found = std::lower_bound(std::begin(expansions), std::end(expansions), c,
                                       [](const Expansion& e, char32_t x) { return e.letter < x; });
  if (found != std::end(expansions) && found->letter == c) {
    out += found->upper;
  } else {
    appendUtf8(out, simpleUpper(c));
  }
}

// Sets at least one of the two high bits of each byte that is a lower-case ASCII letter, one of the
// six signs around those letters, or not ASCII. The lower bits of the result have no meaning.
std::uint64_t notInUpperCase(std::uint64_t word) { return word & (word << 1 | words::highBits); }

// YES only if the text is ASCII without a lower-case letter. NO also for a short text and for one
// with those signs: converting them takes no longer than a better test.
bool isInUpperCase(std::string_view text) {
  if (text.size() < words::size) return false;
  std::uint64_t found = notInUpperCase(words::load(text.data() + text.size() - words::size));
  for (std::size_t at = 0; at + words::size < text.size(); at += words::size) {
    found |= notInUpperCase(words::load(text.data() + at));
  }
  return (found & (0xC0 * words::ones)) == 0;
}

}  // namespace

std::string_view uppercased(std::string_view text, std::string& storage) {
  if (isInUpperCase(text)) return text;
  storage = uppercased(text);
  return storage;
}

std::string uppercased(std::string_view text) {
  std::string out;
  out.reserve(text.size());
  while (!text.empty()) {
    const char c = text.front();
    const Decoded decoded = static_cast<unsigned char>(c) < 0x80 ? Decoded{0, 0} : decode(text);
    if (decoded.length == 0) {
      out += c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
    } else {
      appendUpper(out, decoded.character);
    }
    text.remove_prefix(std::max<std::size_t>(decoded.length, 1));
  }
  return out;
}

}  // namespace qz::text
