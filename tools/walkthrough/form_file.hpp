// SPDX-License-Identifier: MIT
// Files of Qt Designer's, which describe a host's window as well.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools::walkthrough {

/// True if the name is that of a file of Qt Designer's (".ui").
bool namesForm(std::string_view path);

/// Returns the description of the window in the form, in the format of docs/host-windows.md. Throws
/// a Failure if the file does not hold a form, or if this build does not read forms.
std::string describeFormFile(const std::string& path);

}  // namespace qz::tools::walkthrough
