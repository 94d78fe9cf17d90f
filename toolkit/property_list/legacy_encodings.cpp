// SPDX-License-Identifier: MIT
#include "toolkit/property_list/legacy_encodings.hpp"

#include <algorithm>
#include <array>
#include <cstdint>
#include <span>

#include "text/utf8.hpp"

namespace qz::toolkit {
namespace {

struct SingleByteEncoding {
  std::string_view names;  // separated by spaces
  std::u16string_view upperHalf;
};

struct Gb18030Range {
  std::uint16_t number;
  char16_t codePoint;
};

#include "toolkit/property_list/legacy_encoding_tables.inc"

constexpr char16_t undefined = u' ';
constexpr char32_t none = 0xFFFFFFFF;

/// The remaining bytes, from which a decoder takes those of one character.
class Bytes {
 public:
  explicit Bytes(std::string_view bytes) : bytes_(bytes) {}
  bool empty() const { return at_ == bytes_.size(); }
  std::size_t taken() const { return at_; }
  /// Returns the next byte; at the end 0, which continues a character in no encoding.
  unsigned take() { return empty() ? 0 : static_cast<unsigned char>(bytes_[at_++]); }

 private:
  std::string_view bytes_;
  std::size_t at_ = 0;
};

char32_t at(std::u16string_view row, std::size_t index) {
  return index < row.size() && row[index] != undefined ? row[index] : none;
}

char32_t at(std::span<const std::u16string_view> rows, std::size_t row, std::size_t index) {
  return row < rows.size() ? at(rows[row], index) : none;
}

bool isBetween(unsigned byte, unsigned first, unsigned last) {
  return byte >= first && byte <= last;
}

/// Decodes a text in which bytes below 0x80 are ASCII. `decode` returns the character of a first
/// byte and those that follow, or `none`.
template <class Decode>
std::size_t decodeWith(std::string_view bytes, std::string& text, Decode decode) {
  Bytes rest(bytes);
  while (!rest.empty()) {
    const std::size_t start = rest.taken();
    const unsigned first = rest.take();
    const char32_t codePoint = first < 0x80 ? first : decode(first, rest);
    if (codePoint == none) return start;
    text::appendUtf8(text, codePoint);
  }
  return bytes.size();
}

std::size_t decodeLatin1(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned byte, Bytes&) -> char32_t { return byte; });
}

/// Returns a name in the form used for comparison, without case and punctuation.
std::string normalized(std::string_view name) {
  std::string result;
  for (const char c : name) {
    const char lower = c >= 'A' && c <= 'Z' ? static_cast<char>(c | 0x20) : c;
    if ((lower >= 'a' && lower <= 'z') || (lower >= '0' && lower <= '9')) result += lower;
  }
  return result;
}

bool holdsName(std::string_view names, std::string_view normalizedName) {
  for (std::size_t start = 0; start < names.size();) {
    const std::size_t end = std::min(names.find(' ', start), names.size());
    if (normalized(names.substr(start, end - start)) == normalizedName) return true;
    start = end + 1;
  }
  return false;
}

const SingleByteEncoding* singleByteEncoding(std::string_view name) {
  const std::string wanted = normalized(name);
  const auto* const found =
      std::find_if(singleByteEncodings.begin(), singleByteEncodings.end(),
                   [&](const SingleByteEncoding& e) { return holdsName(e.names, wanted); });
  return found == singleByteEncodings.end() ? nullptr : found;
}

std::size_t decodeSingleByte(std::string_view encoding, std::string_view bytes, std::string& text) {
  const std::u16string_view upperHalf = singleByteEncoding(encoding)->upperHalf;
  return decodeWith(bytes, text, [&](unsigned byte, Bytes&) { return at(upperHalf, byte - 0x80); });
}

/// Returns the code point of a four-byte sequence of GB18030. These sequences number the code
/// points that have no two-byte form.
char32_t gb18030CodePoint(std::size_t number) {
  constexpr std::size_t supplementary = 189000;  // 90 30 81 30
  if (number >= supplementary && number <= supplementary + 0xFFFFF) {
    return static_cast<char32_t>(0x10000 + (number - supplementary));
  }
  if (number >= gb18030RangesEnd) return none;
  const auto* const next =
      std::upper_bound(gb18030Ranges.begin(), gb18030Ranges.end(), number,
                       [](std::size_t n, const Gb18030Range& range) { return n < range.number; });
  const Gb18030Range& range = *(next - 1);
  return static_cast<char32_t>(range.codePoint + (number - range.number));
}

std::size_t decodeGb18030(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned first, Bytes& rest) -> char32_t {
    if (!isBetween(first, 0x81, 0xFE)) return none;
    const unsigned second = rest.take();
    if (isBetween(second, 0x40, 0x7E)) return at(gb18030, first - 0x81, second - 0x40);
    if (isBetween(second, 0x80, 0xFE)) return at(gb18030, first - 0x81, second - 0x41);
    const unsigned third = rest.take();
    const unsigned fourth = rest.take();
    if (!isBetween(second, 0x30, 0x39) || !isBetween(third, 0x81, 0xFE) ||
        !isBetween(fourth, 0x30, 0x39)) {
      return none;
    }
    return gb18030CodePoint((((first - 0x81) * 10 + second - 0x30) * 126 + third - 0x81) * 10 +
                            fourth - 0x30);
  });
}

char32_t halfWidthKatakana(unsigned byte) {
  return isBetween(byte, 0xA1, 0xDF) ? 0xFF61 + (byte - 0xA1) : none;
}

std::size_t decodeShiftJis(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned first, Bytes& rest) -> char32_t {
    if (const char32_t katakana = halfWidthKatakana(first); katakana != none) return katakana;
    if (!isBetween(first, 0x81, 0x9F) && !isBetween(first, 0xE0, 0xFC)) return none;
    const unsigned row = first - (first < 0xA0 ? 0x81 : 0xC1);
    const unsigned second = rest.take();
    if (isBetween(second, 0x40, 0x7E)) return at(shiftJis, row, second - 0x40);
    return isBetween(second, 0x80, 0xFC) ? at(shiftJis, row, second - 0x41) : none;
  });
}

std::size_t decodeEucJp(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned first, Bytes& rest) -> char32_t {
    const bool isThreeBytes = first == 0x8F;
    if (first == 0x8E) return halfWidthKatakana(rest.take());
    if (isThreeBytes) first = rest.take();
    const unsigned second = rest.take();
    if (!isBetween(first, 0xA1, 0xFE) || !isBetween(second, 0xA1, 0xFE)) return none;
    const unsigned row = first - 0xA1;
    if (isThreeBytes) return at(jisX0212, row, second - 0xA1);
    // The same characters as in Shift_JIS, where one row holds two rows of this encoding.
    return at(shiftJis, row / 2, row % 2 * 94 + second - 0xA1);
  });
}

std::size_t decodeBig5(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned first, Bytes& rest) -> char32_t {
    if (!isBetween(first, 0x81, 0xFE)) return none;
    const unsigned second = rest.take();
    if (isBetween(second, 0x40, 0x7E)) return at(big5, first - 0x81, second - 0x40);
    return isBetween(second, 0xA1, 0xFE) ? at(big5, first - 0x81, second - 0x62) : none;
  });
}

std::size_t decodeEucKr(std::string_view, std::string_view bytes, std::string& text) {
  return decodeWith(bytes, text, [](unsigned first, Bytes& rest) -> char32_t {
    if (!isBetween(first, 0x81, 0xFE)) return none;
    const unsigned second = rest.take();
    return isBetween(second, 0x41, 0xFE) ? at(eucKr, first - 0x81, second - 0x41) : none;
  });
}

struct NamedDecoder {
  std::string_view names;  // separated by spaces
  LegacyDecoder decoder;
};

constexpr std::array namedDecoders = {
    // Bytes from 0x80 are not US-ASCII; the platform reads them as Latin-1.
    NamedDecoder{"us-ascii ascii iso646-us ansi_x3.4-1968 iso_646.irv:1991 us", decodeLatin1},
    NamedDecoder{"iso-8859-1 iso_8859-1 latin1 l1 ibm819 cp819", decodeLatin1},
    NamedDecoder{"gb18030 gbk cp936 ms936 windows-936 gb2312 euc-cn gb_2312-80", decodeGb18030},
    NamedDecoder{"shift_jis shift-jis ms_kanji sjis windows-31j cp932", decodeShiftJis},
    NamedDecoder{"euc-jp", decodeEucJp},
    NamedDecoder{"big5 cn-big5 windows-950 cp950", decodeBig5},
    NamedDecoder{"euc-kr ks_c_5601-1987 windows-949 cp949", decodeEucKr},
};

}  // namespace

bool isUtf8Name(std::string_view name) { return normalized(name) == "utf8"; }

LegacyDecoder legacyDecoder(std::string_view name) {
  const std::string wanted = normalized(name);
  for (const NamedDecoder& named : namedDecoders) {
    if (holdsName(named.names, wanted)) return named.decoder;
  }
  return singleByteEncoding(name) ? decodeSingleByte : nullptr;
}

}  // namespace qz::toolkit
