// SPDX-License-Identifier: MIT
// One entry of a file that describes a window: reads its fields and reports errors in them.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/value.hpp"
#include "qz/toolkit/geometry.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::walkthrough {

/// Returns the finite number that a value holds, whole or not: from a number, or from a string that
/// spells one from start to end (the old-style format has only strings). Absent for other values.
std::optional<double> numberOf(const toolkit::ValueRef<>& value);

/// An entry with fields under keys. Reading a field that has the wrong kind of value throws a
/// Failure: "FILE:LINE:COLUMN: entry 3: tag: expected …, found …".
class PlistEntry {
 public:
  /// Throws a Failure if `value` is not a dictionary. Messages call the entry `name`, such as
  /// "entry 3". `file` must outlive it.
  PlistEntry(const InputFile& file, std::string name, const toolkit::ValueRef<>& value);

  bool has(std::string_view key) const;
  /// Throws a Failure if the entry has any other key.
  void expectOnly(const std::vector<std::string_view>& keys) const;

  std::string requiredText(std::string_view key) const;
  std::string text(std::string_view key) const;      ///< empty when there is none
  std::int64_t integer(std::string_view key) const;  ///< 0 when there is none
  bool flag(std::string_view key, bool absent) const;
  toolkit::Rect requiredRect(std::string_view key) const;

  [[noreturn]] void fail(std::string_view key, std::string_view expected) const;

 private:
  toolkit::ValueRef<> valueOf(std::string_view key) const;
  /// Throws a Failure at the place of `value`.
  [[noreturn]] void failAt(const toolkit::ValueRef<>& value, const std::string& message) const;

  const InputFile& file_;
  std::string name_;
  toolkit::ValueRef<> value_;
  toolkit::ValueRef<toolkit::Dictionary> fields_;
};

}  // namespace qz::tools::walkthrough
