// SPDX-License-Identifier: MIT
// Single values of a source as YAML.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace qz::tools::lift {

/// Returns a text as a scalar that can be a key or a value anywhere: plain if that is possible,
/// else between double quotes.
std::string scalar(std::string_view text);

/// Returns `{a: b, c: d}`; keys and values are YAML already.
std::string flowTable(const std::vector<std::pair<std::string, std::string>>& entries);

/// Returns `[a, b]`, or the only element itself.
std::string flowList(const std::vector<std::string>& elements);

}  // namespace qz::tools::lift
