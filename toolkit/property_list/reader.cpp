// SPDX-License-Identifier: MIT
#include "qz/property_list/reader.hpp"

#include <algorithm>
#include <utility>

#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/refusal.hpp"
#include "text/hexadecimal.hpp"
#include "toolkit/property_list/binary_layout.hpp"
#include "toolkit/property_list/encoding.hpp"

namespace qz::toolkit {
namespace {

using FormatReader = Value* (*)(std::string_view, Document&, ValueOffsets*);

/// One attempt to read a text or file in one format.
struct Attempt {
  ValueRef<> value;
  ValueOffsets offsets;
  std::optional<RefusedAt> refusal;
};

Attempt attempt(FormatReader read, std::string_view text, bool wantsOffsets) {
  Attempt attempt;
  const auto document = Counted<Document>::adopt(Document::make());
  try {
    attempt.value = Counted<Value>::share(
        read(text, *document.get(), wantsOffsets ? &attempt.offsets : nullptr));
  } catch (RefusedAt& refusal) {
    attempt.refusal = std::move(refusal);
  }
  return attempt;
}

/// Whether a text that neither reader accepts was meant as XML rather than as old-style data in <
/// >.
bool looksLikeXml(std::string_view text) {
  const std::size_t start = text.find_first_not_of(" \t\r\n");
  if (start == std::string_view::npos || text[start] != '<') return false;
  const std::string_view tag = text.substr(start + 1);
  return !tag.empty() && tag.front() != '>' && tag.front() != '*' && tag.front() != '[' &&
         !std::all_of(tag.begin(), std::find(tag.begin(), tag.end(), '>'),
                      [](char c) { return c == ' ' || text::hexadecimalDigit(c) >= 0; });
}

ReadResult refused(Format format, Position position, std::string reason) {
  return {nullptr, format, Refusal{format, position, std::move(reason)}};
}

ReadResult refusedInText(Format format, std::string_view text, const RefusedAt& refusal) {
  return refused(format, TextCursor(text).at(refusal.offset), refusal.reason);
}

ReadResult readText(std::string_view bytes, PositionTable* positions) {
  const DecodedText decoded = decodeText(bytes);
  const std::string_view text = decoded.text();
  const Format likely = looksLikeXml(text) ? Format::xml : Format::oldStyle;
  if (decoded.refusal) return refusedInText(likely, text, *decoded.refusal);
  if (text.empty()) return refused(likely, TextPosition{1, 1}, "the file is empty");
  std::optional<RefusedAt> reason;
  for (const auto& [format, read] :
       {std::pair{Format::xml, &readXml}, std::pair{Format::oldStyle, &readOldStyle}}) {
    Attempt tried = attempt(read, text, positions != nullptr);
    if (tried.value) {
      if (positions) *positions = PositionTable(std::move(tried.offsets), text);
      return {tried.value, format, std::nullopt};
    }
    if (format == likely) reason = std::move(tried.refusal);
  }
  return refusedInText(likely, text, *reason);
}

}  // namespace

std::string_view description(Format format) {
  switch (format) {
    case Format::binary:
      return "binary property list";
    case Format::xml:
      return "XML property list";
    case Format::oldStyle:
      return "old-style property list";
  }
  return "";
}

std::string Refusal::description() const {
  return toolkit::description(position) + ": " + reason + " (read as " +
         std::string(toolkit::description(format)) + ")";
}

ReadResult readPropertyList(std::string_view bytes, PositionTable* positions) {
  if (!bytes.starts_with(binary::magic)) return readText(bytes, positions);
  Attempt tried = attempt(&readBinary, bytes, positions != nullptr);
  if (tried.value) {
    if (positions) *positions = PositionTable(std::move(tried.offsets), std::nullopt);
    return {tried.value, Format::binary, std::nullopt};
  }
  // Some texts start like a binary file: the magic number itself is an old-style string.
  ReadResult asText = readText(bytes, positions);
  if (asText.value) return asText;
  return refused(Format::binary, BytePosition{tried.refusal->offset}, tried.refusal->reason);
}

ValueRef<Dictionary> dictionaryFromPropertyList(std::string_view bytes) {
  const auto root = asDictionary(readPropertyList(bytes).value);
  return root ? root->copy(Mutability::changeable) : nullptr;
}

}  // namespace qz::toolkit
