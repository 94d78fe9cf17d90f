// SPDX-License-Identifier: MIT
// The kinds of view, by their names in host windows and scenarios.
#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "toolkit/test_driver.hpp"

namespace tools {

/// Returns the kind with that name, such as "NSButton:toggle"; absent for any other name.
std::optional<toolkit::ViewKind> viewKindNamed(std::string_view name);

/// Returns every name, in the order of the documentation.
std::vector<std::string_view> viewKindNames();

}  // namespace tools
