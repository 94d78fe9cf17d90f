// The property lists that the tool is given. Whatever is wrong with one ends the command with a
// Failure that says where and what was expected.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/value.hpp"

namespace tools::play {

/// The value in the property list at `path`, of any of the three formats. `what` names what the
/// file was to hold, such as "a script".
toolkit::ValueRef<> readPropertyListFile(const std::string& path, std::string_view what);

/// The same where the root must be a dictionary.
toolkit::ValueRef<toolkit::Dictionary> readDictionaryFile(const std::string& path,
                                                          std::string_view what);

/// A value as a message shows what was found, such as `the string “abc”` or "an array"; "nothing"
/// when it is absent.
std::string foundWords(const toolkit::ValueRef<>& value);

}  // namespace tools::play
