// SPDX-License-Identifier: MIT
// The row of old-style property lists.
#include "toolkit/property_list/format_rows.hpp"

namespace qz::toolkit {
namespace {

constexpr std::string_view oldStyleSuffixes[] = {".strings"};

}  // namespace

constexpr FormatRow oldStyleFormat = {
    .format = Format::oldStyle,
    .name = "old-style",
    .title = "old-style property list",
    .isText = true,
    .looksLike = looksLikeOldStyle,
    .read = readOldStyle,
    .write = nullptr,
    .writesSharedOnce = false,
    .suffixes = oldStyleSuffixes,
};

}  // namespace qz::toolkit
