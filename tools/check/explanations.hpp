// SPDX-License-Identifier: MIT
// The entries of the documentation's page about checking, for people at a terminal.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace qz::tools::check {

/// Returns what the page says of a code, with an example; absent if the page has no such entry.
std::optional<std::string> explanationOf(std::string_view code);

}  // namespace qz::tools::check
