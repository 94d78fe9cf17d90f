// SPDX-License-Identifier: MIT
// The table of the property-list formats, which readers, writers and tools share. A new format is a
// row of formats.inc, and its own files.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/property_list/document.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// The formats, in the order in which they are tried.
enum class Format : std::uint8_t {
#define QZ_FORMAT(name, value) name = (value),
#include "qz/property_list/formats.inc"
#undef QZ_FORMAT
};

/// What is known of a format.
struct QZ_API FormatRow {
  Format format;           ///< the format of the row
  std::string_view name;   ///< for options, such as "xml"
  std::string_view title;  ///< for messages, such as "XML property list"
  /// Whether files are text, which has lines and an encoding. Then `looksLike` and `read` receive
  /// the text in UTF-8, otherwise the bytes of the file.
  bool isText;
  /// Whether a file was probably meant as this format. Bytes are read only as a format that they
  /// look like. A text is read as every text format; this chooses the one that messages are about.
  bool (*looksLike)(std::string_view contents);
  /// Makes the values in the document, and returns the root; throws RefusedAt.
  Value* (*read)(std::string_view contents, Document& document, ValueOffsets* offsets);
  /// Returns the value as a whole file; raises an invalid-argument exception for a value that the
  /// format cannot hold. Null if the format has no writer.
  std::string (*write)(const ValueRef<>& value);
  /// Whether a collection that is in many places is written only once.
  bool writesSharedOnce;
  std::span<const std::string_view> suffixes;  ///< of the names of files, such as ".xml"
};

/// Returns all formats, in the order in which they are tried. The last row is a text format.
QZ_API std::span<const FormatRow> formats();

/// Returns the row of the format.
QZ_API const FormatRow& formatRow(Format format);

/// Returns the title of the format, such as "XML property list".
QZ_API std::string_view description(Format format);

}  // namespace qz::toolkit
