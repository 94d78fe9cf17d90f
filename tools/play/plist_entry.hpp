// SPDX-License-Identifier: MIT
// One entry of a file that describes a window: reading its fields, and saying what is wrong with
// them.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/geometry.hpp"
#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/value.hpp"
#include "tools/play/input_file.hpp"

namespace tools::play {

/// A number as files write it, whole or not: a number, or a string that is one from start to end
/// (the old-style format has nothing but strings).
std::optional<double> numberOf(const toolkit::ValueRef<>& value);

/// An entry whose fields stand under keys. Reading a field that is not what it should be throws a
/// Failure: "FILE:LINE:COLUMN: entry 3: tag: expected …, found …".
class PlistEntry {
 public:
  /// `name` is how messages call it, such as "entry 3". The file outlives it.
  PlistEntry(const InputFile& file, std::string name, const toolkit::ValueRef<>& value);

  bool has(std::string_view key) const;
  /// Fails when the entry has a key that is none of these.
  void expectOnly(const std::vector<std::string_view>& keys) const;

  std::string requiredText(std::string_view key) const;
  std::string text(std::string_view key) const;      ///< empty when there is none
  std::int64_t integer(std::string_view key) const;  ///< 0 when there is none
  bool flag(std::string_view key, bool absent) const;
  toolkit::Rect requiredRect(std::string_view key) const;

  [[noreturn]] void fail(std::string_view key, std::string_view expected) const;

 private:
  toolkit::ValueRef<> valueOf(std::string_view key) const;
  /// `value` is what the message is about.
  [[noreturn]] void failAt(const toolkit::ValueRef<>& value, const std::string& message) const;

  const InputFile& file_;
  std::string name_;
  toolkit::ValueRef<> value_;
  toolkit::ValueRef<toolkit::Dictionary> fields_;
};

}  // namespace tools::play
