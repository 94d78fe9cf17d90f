// SPDX-License-Identifier: MIT
// The documentation's page about checking, as a text.
#pragma once

#include <string_view>

namespace qz::tools::check {

/// Returns docs/checking.md as it was at the build.
std::string_view checkingPage();

}  // namespace qz::tools::check
