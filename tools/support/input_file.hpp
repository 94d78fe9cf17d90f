// SPDX-License-Identifier: MIT
// The property lists that the tool reads. An error in one ends the command with a Failure that says
// where ("FILE:LINE:COLUMN"), what is wrong, and what was expected.
#pragma once

#include <string>
#include <string_view>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/positions.hpp"
#include "qz/property_list/value.hpp"
#include "tools/support/failure.hpp"

namespace qz::tools {

class InputFile {
 public:
  /// Reads the property list at `path`, in any of the formats. `what` names what the file should
  /// hold, such as "a script"; `refusal` is the Failure's status if it holds something else.
  InputFile(std::string path, std::string_view what, ExitStatus refusal = ExitStatus::badInput);
  /// Reads the contents that the file at `path` has, or that have been made from it.
  InputFile(std::string path, std::string_view what, std::string_view contents);

  /// Takes a property list that was made of a text: of `text`, at `offsets`.
  InputFile(std::string path, std::string_view what, toolkit::ValueRef<> root,
            toolkit::ValueOffsets offsets, std::string_view text);

  const std::string& path() const { return path_; }
  const toolkit::ValueRef<>& root() const { return root_; }
  /// Returns the root; throws a Failure if it is not a dictionary.
  toolkit::ValueRef<toolkit::Dictionary> dictionary() const;

  /// Returns the position of a value of this file; absent for any other value.
  std::optional<toolkit::Position> positionOf(const toolkit::ValueRef<>& value) const {
    return positions_.of(*value);
  }
  /// Returns the place of a value of this file, such as "intro.plist:12:5"; the path alone for any
  /// other value.
  std::string placeOf(const toolkit::ValueRef<>& value) const;
  /// Throws a Failure: `message`, at the place of `value` in this file.
  [[noreturn]] void fail(const toolkit::ValueRef<>& value, const std::string& message) const;

 private:
  void read(std::string_view contents);

  std::string path_;
  std::string what_;
  ExitStatus refusal_;
  toolkit::ValueRef<> root_;
  toolkit::PositionTable positions_;
};

/// Returns the contents of the file at `path`. Throws a Failure if it cannot be read; `what` names
/// what it should hold.
std::string requireContents(const std::string& path, const std::string& what);

/// Says what was found, for a message: `the string “abc”` or "an array of 3", for example;
/// "nothing" if the value is absent.
std::string foundWords(const toolkit::ValueRef<>& value);

}  // namespace qz::tools
