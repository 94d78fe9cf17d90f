// SPDX-License-Identifier: MIT
// Describes the window in a file of Qt Designer's, which Qt's form loader makes from the file.
#pragma once

#include <string>
#include <string_view>

namespace qz::hosts::forms {

/// Returns the description of the window in a form, as `WalkThrough::describe` does for a running
/// window. `form` is the contents of the file, and `directory` its folder, for icons. Throws a
/// std::runtime_error with the reason if the file does not hold a form.
std::string describeForm(std::string_view form, const std::string& directory);

}  // namespace qz::hosts::forms
