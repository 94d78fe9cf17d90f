// SPDX-License-Identifier: MIT
// The formats in which the tool writes property lists.
#pragma once

#include <string>
#include <vector>

#include "qz/property_list/formats.hpp"

namespace qz::tools {

/// The format of a file whose suffix says nothing.
inline constexpr toolkit::Format standardFormat = toolkit::Format::xml;

/// Returns the formats that can be written, the standard one first.
std::vector<toolkit::FormatRow> writableFormats();

/// Returns the format that the suffix of a path chooses.
toolkit::Format formatBySuffix(const std::string& path);

}  // namespace qz::tools
