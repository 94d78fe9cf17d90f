// SPDX-License-Identifier: MIT
// Reads property lists in the formats of the platform: binary, XML and old-style.
//
// Accepts the same files as the platform's own reader, with the same results, down to its oddities.
// Any bytes are safe to read: time and memory are proportional to their number, and collections
// nest at most 512 levels deep.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/formats.hpp"
#include "qz/property_list/positions.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Why bytes are not a property list.
struct QZ_API Refusal {
  Format format;       ///< the most likely format; `reason` is that reader's
  Position position;   ///< where the reader stopped
  std::string reason;  ///< what it expected and found, in words

  /// Returns text such as "line 3, column 7: expected </dict> (read as XML property list)".
  std::string description() const;
};

/// What came of reading a file.
struct QZ_API ReadResult {
  ValueRef<> value;                ///< the root, of any kind; absent if there is a refusal
  Format format;                   ///< the format that was read or refused
  std::optional<Refusal> refusal;  ///< why there is no value; absent if there is one
};

/// Reads a whole file. `bytes` need not outlive the call. `positions`, if given, receives the
/// position of every value, unless the file is refused.
QZ_API ReadResult readPropertyList(std::string_view bytes, PositionTable* positions = nullptr);

/// Reads a whole file as a mutable dictionary with immutable values; absent if the bytes are not a
/// property list or the root is not a dictionary.
QZ_API ValueRef<Dictionary> dictionaryFromPropertyList(std::string_view bytes);

}  // namespace qz::toolkit
