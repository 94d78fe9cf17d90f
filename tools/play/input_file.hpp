// SPDX-License-Identifier: MIT
// The property lists that the tool is given. Whatever is wrong with one ends the command with a
// Failure that says where ("FILE:LINE:COLUMN"), what is wrong, and what was expected.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/positions.hpp"
#include "toolkit/property_list/value.hpp"
#include "tools/failure.hpp"

namespace tools::play {

class InputFile {
 public:
  /// Reads the property list at `path`, in any of the formats. `what` is what the file is to hold,
  /// such as "a script"; `refusal` is the Failure's status where it is not that.
  InputFile(std::string path, std::string_view what, ExitStatus refusal = ExitStatus::badInput);

  const std::string& path() const { return path_; }
  const toolkit::ValueRef<>& root() const { return root_; }
  /// The root of a file that must be a dictionary.
  toolkit::ValueRef<toolkit::Dictionary> dictionary() const;

  /// Such as "intro.plist:12:5", for a value of this file; the path alone for any other.
  std::string placeOf(const toolkit::ValueRef<>& value) const;
  /// Ends the command: `message` is about `value`, which stands in this file.
  [[noreturn]] void fail(const toolkit::ValueRef<>& value, const std::string& message) const;

 private:
  void read();

  std::string path_;
  std::string what_;
  ExitStatus refusal_;
  toolkit::ValueRef<> root_;
  toolkit::PositionTable positions_;
};

/// A value as a message shows what was found, such as `the string “abc”` or "an array of 3";
/// "nothing" when it is absent.
std::string foundWords(const toolkit::ValueRef<>& value);

}  // namespace tools::play
