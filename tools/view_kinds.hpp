// SPDX-License-Identifier: MIT
// The kinds of view by the names that hosts' windows and scenarios write.
#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "toolkit/test_driver.hpp"

namespace tools {

/// The kind named, such as "NSButton:toggle"; nothing for any other name.
std::optional<toolkit::ViewKind> viewKindNamed(std::string_view name);

/// Every name, in the order in which they are documented.
std::vector<std::string_view> viewKindNames();

}  // namespace tools
