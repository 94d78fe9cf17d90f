// SPDX-License-Identifier: MIT
// The positions of values in the file from which they were read, for example for messages.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <variant>

#include "qz/api.hpp"
#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// A position in a text. Both count from 1; a column is one character, whatever its display width.
struct QZ_API TextPosition {
  std::size_t line;    ///< from 1
  std::size_t column;  ///< from 1, in characters
  friend bool operator==(const TextPosition&, const TextPosition&) = default;
};

/// A position in a binary file, counted from 0.
struct QZ_API BytePosition {
  std::size_t offset;  ///< from 0
  friend bool operator==(const BytePosition&, const BytePosition&) = default;
};

/// A position in a file of any format.
using Position = std::variant<TextPosition, BytePosition>;

/// Returns text such as "line 3, column 7" or "byte 42".
QZ_API std::string description(const Position& position);

/// Converts offsets in a text to positions, moving forward only.
class QZ_API TextCursor {
 public:
  /// `text` is UTF-8, valid or not, and must outlive this.
  explicit TextCursor(std::string_view text) : text_(text) {}
  /// Returns the position of the byte `offset`, which must not be before that of the previous call.
  /// A line ends with LF, CR or CR LF.
  TextPosition at(std::size_t offset);

 private:
  std::string_view text_;
  std::size_t offset_ = 0;
  TextPosition position_{1, 1};
};

/// The positions of the values of one file, including dictionary keys. Values do not store their
/// positions; this table does, and it is built only on request.
class QZ_API PositionTable {
 public:
  PositionTable() = default;
  /// `text` is the text in which the offsets count; absent for a binary file.
  PositionTable(ValueOffsets offsets, std::optional<std::string_view> text);

  /// Returns the start of a value: its tag, first character or marker byte. Absent for a value that
  /// is not from this file.
  std::optional<Position> of(const Value& value) const;

 private:
  std::unordered_map<const Value*, Position> positions_;
};

}  // namespace qz::toolkit
