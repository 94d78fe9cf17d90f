// SPDX-License-Identifier: MIT
// Reads property lists in the three formats that the platform has: binary, XML and old-style.
//
// What is accepted, and what it yields, is what the platform's own reader does, down to its
// oddities. Any bytes may be read: time and memory stay in proportion to their number, and
// collections nest to 512 levels.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/positions.hpp"
#include "toolkit/property_list/value.hpp"

namespace toolkit {

enum class Format : std::uint8_t { binary, xml, oldStyle };

/// Such as "XML property list".
std::string_view description(Format format);

/// Why bytes are no property list.
struct Refusal {
  Format format;  ///< what the bytes look like most; only that reader's reason is told
  Position position;
  std::string reason;

  /// Such as "line 3, column 7: expected </dict> (read as XML property list)".
  std::string description() const;
};

struct ReadResult {
  ValueRef<> value;  ///< the root, of any kind; absent when there is a refusal
  Format format;     ///< what was read, or what was refused
  std::optional<Refusal> refusal;
};

/// Reads a whole file. `bytes` need not outlive the call. Where `positions` is given it receives
/// the place of every value, unless there is a refusal.
ReadResult readPropertyList(std::string_view bytes, PositionTable* positions = nullptr);

/// Reads a whole file as a dictionary that can be changed, whose values cannot: absent when the
/// bytes are no property list, or their root is no dictionary.
ValueRef<Dictionary> dictionaryFromPropertyList(std::string_view bytes);

}  // namespace toolkit
