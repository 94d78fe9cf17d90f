// SPDX-License-Identifier: MIT
// The property lists that the tool reads. An error in one ends the command with a Failure that says
// where ("FILE:LINE:COLUMN"), what is wrong, and what was expected.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/positions.hpp"
#include "qz/property_list/value.hpp"
#include "tools/support/failure.hpp"

namespace qz::tools {

/// A file in which values were written.
struct WrittenFile {
  std::string path{};
  toolkit::PositionTable positions{};
};

class InputFile {
 public:
  /// Reads the property list at `path`, in any of the formats. `what` names what the file should
  /// hold, such as "a script"; `refusal` is the Failure's status if it holds something else.
  InputFile(std::string path, std::string_view what, ExitStatus refusal = ExitStatus::badInput);
  /// Reads the contents that the file at `path` has, or that have been made from it.
  InputFile(std::string path, std::string_view what, std::string_view contents);

  /// Takes a property list that was made of other files, in which its values were written.
  InputFile(std::string path, std::string_view what, toolkit::ValueRef<> root,
            std::vector<WrittenFile> written);

  const std::string& path() const { return path_; }
  const toolkit::ValueRef<>& root() const { return root_; }
  /// Returns the root; throws a Failure if it is not a dictionary.
  toolkit::ValueRef<toolkit::Dictionary> dictionary() const;

  /// Returns the path of the file in which a value was written; that of this file for any other
  /// value.
  const std::string& pathOf(const toolkit::ValueRef<>& value) const;
  /// Returns the position of a value in that file; absent for any other value.
  std::optional<toolkit::Position> positionOf(const toolkit::ValueRef<>& value) const;
  /// Returns the place of a value of this file, such as "intro.plist:12:5"; the path alone for any
  /// other value.
  std::string placeOf(const toolkit::ValueRef<>& value) const;
  /// Throws a Failure: `message`, at the place of `value` in this file.
  [[noreturn]] void fail(const toolkit::ValueRef<>& value, const std::string& message) const;

 private:
  void read(std::string_view contents);
  const WrittenFile* writtenFileOf(const toolkit::ValueRef<>& value) const;

  std::string path_;
  std::string what_;
  ExitStatus refusal_;
  toolkit::ValueRef<> root_;
  std::vector<WrittenFile> written_;
};

/// Returns the contents of the file at `path`. Throws a Failure if it cannot be read; `what` names
/// what it should hold.
std::string requireContents(const std::string& path, const std::string& what);

/// Says what was found, for a message: `the string “abc”` or "an array of 3", for example;
/// "nothing" if the value is absent.
std::string foundWords(const toolkit::ValueRef<>& value);

}  // namespace qz::tools
