// SPDX-License-Identifier: MIT
#include "qz/property_list/reader.hpp"

#include <algorithm>
#include <utility>

#include "qz/property_list/refusal.hpp"
#include "toolkit/property_list/encoding.hpp"

namespace qz::toolkit {
namespace {

/// One attempt to read a text or file in one format.
struct Attempt {
  ValueRef<> value;
  ValueOffsets offsets;
  std::optional<RefusedAt> refusal;
};

Attempt attempt(const FormatRow& row, std::string_view contents, bool wantsOffsets) {
  Attempt attempt;
  const auto document = Counted<Document>::adopt(Document::make());
  try {
    attempt.value = Counted<Value>::share(
        row.read(contents, *document.get(), wantsOffsets ? &attempt.offsets : nullptr));
  } catch (RefusedAt& refusal) {
    attempt.refusal = std::move(refusal);
  }
  return attempt;
}

ReadResult refused(Format format, Position position, std::string reason) {
  return {nullptr, format, Refusal{format, position, std::move(reason)}};
}

ReadResult refusedInText(Format format, std::string_view text, const RefusedAt& refusal) {
  return refused(format, TextCursor(text).at(refusal.offset), refusal.reason);
}

/// Returns the text format as which a text was probably meant.
const FormatRow& likelyTextFormat(std::string_view text) {
  const auto rows = formats();
  const auto found = std::find_if(rows.begin(), rows.end(), [&](const FormatRow& row) {
    return row.isText && row.looksLike(text);
  });
  return found == rows.end() ? rows.back() : *found;
}

ReadResult readText(std::string_view bytes, PositionTable* positions) {
  const DecodedText decoded = decodeText(bytes);
  const std::string_view text = decoded.text();
  const Format likely = likelyTextFormat(text).format;
  if (decoded.refusal) return refusedInText(likely, text, *decoded.refusal);
  if (text.empty()) return refused(likely, TextPosition{1, 1}, "the file is empty");
  std::optional<RefusedAt> reason;
  for (const FormatRow& row : formats()) {
    if (!row.isText) continue;
    Attempt tried = attempt(row, text, positions != nullptr);
    if (tried.value) {
      if (positions) *positions = PositionTable(std::move(tried.offsets), text);
      return {tried.value, row.format, std::nullopt};
    }
    if (row.format == likely) reason = std::move(tried.refusal);
  }
  return refusedInText(likely, text, *reason);
}

/// Reads a file that is not text as each format that it looks like. Absent if it looks like none.
/// If all refuse it, the first refusal counts.
std::optional<ReadResult> readBytes(std::string_view bytes, PositionTable* positions) {
  std::optional<ReadResult> refusal;
  for (const FormatRow& row : formats()) {
    if (row.isText || !row.looksLike(bytes)) continue;
    Attempt tried = attempt(row, bytes, positions != nullptr);
    if (tried.value) {
      if (positions) *positions = PositionTable(std::move(tried.offsets), std::nullopt);
      return ReadResult{tried.value, row.format, std::nullopt};
    }
    if (refusal) continue;
    refusal = refused(row.format, BytePosition{tried.refusal->offset}, tried.refusal->reason);
  }
  return refusal;
}

}  // namespace

std::string Refusal::description() const {
  return toolkit::description(position) + ": " + reason + " (read as " +
         std::string(toolkit::description(format)) + ")";
}

ReadResult readPropertyList(std::string_view bytes, PositionTable* positions) {
  std::optional<ReadResult> asBytes = readBytes(bytes, positions);
  if (asBytes && asBytes->value) return *std::move(asBytes);
  // Some texts start like a binary file: the magic number itself is an old-style string.
  ReadResult asText = readText(bytes, positions);
  return asText.value || !asBytes ? asText : *std::move(asBytes);
}

ValueRef<Dictionary> dictionaryFromPropertyList(std::string_view bytes) {
  const auto root = asDictionary(readPropertyList(bytes).value);
  return root ? root->copy(Mutability::changeable) : nullptr;
}

}  // namespace qz::toolkit
