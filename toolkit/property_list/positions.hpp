// SPDX-License-Identifier: MIT
// Where in its file each value stands that was read from it, for whoever wants to point there.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <variant>

#include "toolkit/property_list/format_readers.hpp"
#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// A place in a text. Both count from 1; a column is a character, wherever it is shown.
struct TextPosition {
  std::size_t line;
  std::size_t column;
  friend bool operator==(const TextPosition&, const TextPosition&) = default;
};

/// A place in a binary file, counted from 0.
struct BytePosition {
  std::size_t offset;
  friend bool operator==(const BytePosition&, const BytePosition&) = default;
};

using Position = std::variant<TextPosition, BytePosition>;

/// Such as "line 3, column 7" or "byte 42".
std::string description(const Position& position);

/// Walks forward through a text and says where it is.
class TextCursor {
 public:
  /// `text` is UTF-8, valid or not, and must outlive this.
  explicit TextCursor(std::string_view text) : text_(text) {}
  /// The position of the byte `offset`, which is not before the one asked for last. A line ends
  /// with LF, CR or both.
  TextPosition at(std::size_t offset);

 private:
  std::string_view text_;
  std::size_t offset_ = 0;
  TextPosition position_{1, 1};
};

/// The positions of the values of one file, dictionaries' keys among them. Values do not know where
/// they stand; this is kept beside them, and only where somebody asks for it.
class PositionTable {
 public:
  PositionTable() = default;
  /// `text` is what the offsets count in, or absent for those of a binary file.
  PositionTable(ValueOffsets offsets, std::optional<std::string_view> text);

  /// Where a value starts: its tag or first character, or its marker byte; absent for a value that
  /// is not of this file.
  std::optional<Position> of(const Value& value) const;

 private:
  std::unordered_map<const Value*, Position> positions_;
};

}  // namespace toolkit
