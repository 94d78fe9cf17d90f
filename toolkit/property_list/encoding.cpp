// SPDX-License-Identifier: MIT
#include "toolkit/property_list/encoding.hpp"

#include <bit>

#include "text/utf8.hpp"
#include "toolkit/property_list/legacy_encodings.hpp"

namespace qz::toolkit {
namespace {

enum class Scheme { utf8, utf16, utf32 };

struct Mark {
  Scheme scheme;
  std::endian order;
  std::size_t size;
};

/// Returns the encoding shown by the first bytes; it overrides any declaration.
std::optional<Mark> byteOrderMarkOf(std::string_view file) {
  using namespace std::string_view_literals;
  constexpr auto little = std::endian::little;
  constexpr auto big = std::endian::big;
  // As on the platform, a mark at the very end of the file does not count.
  if (file.size() > 4 && file.starts_with("\0\0\xFE\xFF"sv)) return Mark{Scheme::utf32, big, 4};
  if (file.size() > 4 && file.starts_with("\xFF\xFE\0\0"sv)) return Mark{Scheme::utf32, little, 4};
  if (file.size() > 3 && file.starts_with("\xEF\xBB\xBF"sv)) return Mark{Scheme::utf8, big, 3};
  if (file.size() <= 2) return std::nullopt;
  if (file.starts_with("\xFF\xFE"sv)) return Mark{Scheme::utf16, little, 2};
  if (file.starts_with("\xFE\xFF"sv)) return Mark{Scheme::utf16, big, 2};
  // UTF-16 without a mark. Like the platform, skip two bytes as if there were a mark: the first
  // character is lost.
  if (file[0] == '\0' || file[1] == '\0') return Mark{Scheme::utf16, std::endian::native, 2};
  return std::nullopt;
}

/// Returns the quoted value of `encoding=` in a declaration at the very start.
std::optional<std::string_view> declaredName(std::string_view file) {
  constexpr std::string_view declaration = "<?xml";
  constexpr std::string_view attribute = "encoding=";
  if (!file.starts_with(declaration)) return std::nullopt;
  const std::string_view attributes = file.substr(declaration.size());
  const std::size_t found = attributes.find(attribute);
  if (found == std::string_view::npos || attributes.find_first_of("?>") < found) {
    return std::nullopt;
  }
  const std::string_view value = attributes.substr(found + attribute.size());
  if (!value.starts_with('"') && !value.starts_with('\'')) return std::nullopt;
  const std::size_t end = value.find(value.front(), 1);
  if (end == std::string_view::npos) return std::nullopt;
  return value.substr(1, end - 1);
}

/// Returns one unit of UTF-16 or UTF-32.
char32_t unitAt(std::string_view bytes, std::size_t at, std::size_t size, std::endian order) {
  char32_t unit = 0;
  for (std::size_t i = 0; i < size; ++i) {
    const std::size_t byte = order == std::endian::big ? at + i : at + size - 1 - i;
    unit = (unit << 8) | static_cast<unsigned char>(bytes[byte]);
  }
  return unit;
}

/// Appends the text of UTF-16 or UTF-32; false at a unit that is not a character. Bytes at the end
/// that do not form a unit are ignored.
bool convertUnits(std::string_view bytes, std::size_t size, std::endian order, std::string& text) {
  text.reserve(bytes.size() / size);
  for (std::size_t at = 0; at + size <= bytes.size(); at += size) {
    char32_t unit = unitAt(bytes, at, size, order);
    if (size == 2 && text::isHighSurrogate(unit) && at + 4 <= bytes.size()) {
      const char32_t next = unitAt(bytes, at + 2, size, order);
      if (text::isLowSurrogate(next)) {
        unit = text::combineSurrogates(unit, next);
        at += 2;
      }
    }
    if (text::isSurrogate(unit) || unit > 0x10FFFF) return false;
    text::appendUtf8(text, unit);
  }
  return true;
}

DecodedText decodeMarked(std::string_view file, const Mark& mark) {
  DecodedText decoded;
  const std::string_view bytes = file.substr(mark.size);
  if (mark.scheme == Scheme::utf8) {
    decoded.bytes = bytes;
    return decoded;
  }
  decoded.isConverted = true;
  const bool isUtf16 = mark.scheme == Scheme::utf16;
  if (!convertUnits(bytes, isUtf16 ? 2 : 4, mark.order, decoded.converted)) {
    decoded.refusal = {decoded.converted.size(),
                       isUtf16 ? "the text is not valid UTF-16" : "the text is not valid UTF-32"};
  }
  return decoded;
}

DecodedText decodeDeclared(std::string_view file, std::string_view name) {
  DecodedText decoded;
  decoded.isConverted = true;
  const LegacyDecoder decode = legacyDecoder(name);
  if (!decode) {
    decoded.converted =
        std::string(file.substr(0, static_cast<std::size_t>(name.data() - file.data())));
    decoded.refusal = {decoded.converted.size(), "unknown encoding \"" + std::string(name) + "\""};
    return decoded;
  }
  decoded.converted.reserve(file.size());
  if (decode(name, file, decoded.converted) != file.size()) {
    decoded.refusal = {decoded.converted.size(),
                       "the text is not valid in the encoding " + std::string(name)};
  }
  return decoded;
}

}  // namespace

DecodedText decodeText(std::string_view file) {
  if (const auto mark = byteOrderMarkOf(file)) return decodeMarked(file, *mark);
  const auto name = declaredName(file);
  if (name && !isUtf8Name(*name)) return decodeDeclared(file, *name);
  DecodedText decoded;
  decoded.bytes = file;
  return decoded;
}

}  // namespace qz::toolkit
