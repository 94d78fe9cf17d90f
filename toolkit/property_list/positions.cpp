// SPDX-License-Identifier: MIT
#include "qz/property_list/positions.hpp"

#include <algorithm>

namespace qz::toolkit {

std::string description(const Position& position) {
  if (const auto* byte = std::get_if<BytePosition>(&position)) {
    return "byte " + std::to_string(byte->offset);
  }
  const auto& [line, column] = std::get<TextPosition>(position);
  return "line " + std::to_string(line) + ", column " + std::to_string(column);
}

TextPosition TextCursor::at(std::size_t offset) {
  for (; offset_ < std::min(offset, text_.size()); ++offset_) {
    const char c = text_[offset_];
    const bool isFirstOfTwo = c == '\r' && text_.substr(offset_ + 1).starts_with('\n');
    if (c == '\n' || (c == '\r' && !isFirstOfTwo)) {
      position_ = {position_.line + 1, 1};
    } else if ((static_cast<unsigned char>(c) & 0xC0) != 0x80) {
      ++position_.column;
    }
  }
  return position_;
}

PositionTable::PositionTable(ValueOffsets offsets, std::optional<std::string_view> text) {
  std::sort(offsets.begin(), offsets.end(),
            [](const auto& a, const auto& b) { return a.second < b.second; });
  positions_.reserve(offsets.size());
  TextCursor cursor(text.value_or(std::string_view()));
  for (const auto& [value, offset] : offsets) {
    positions_.emplace(value, text ? Position(cursor.at(offset)) : Position(BytePosition{offset}));
  }
}

std::optional<Position> PositionTable::of(const Value& value) const {
  const auto found = positions_.find(&value);
  if (found == positions_.end()) return std::nullopt;
  return found->second;
}

}  // namespace qz::toolkit
