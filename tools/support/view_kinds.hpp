// SPDX-License-Identifier: MIT
// The kinds of view, by their names in host windows and scenarios.
#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "drivers/driver.hpp"

namespace qz::tools {

/// Returns the kind with that name, such as "NSButton:toggle"; absent for any other name.
std::optional<drivers::ViewKind> viewKindNamed(std::string_view name);

/// Returns every name, in the order of the documentation.
std::vector<std::string_view> viewKindNames();

}  // namespace qz::tools
