// SPDX-License-Identifier: MIT
// The standard names of the classes of windows and views, as scripts' descriptions and scenarios
// spell them. A toolkit may have other names.
#pragma once

#include <string_view>

namespace qz::toolkit::class_names {

inline constexpr std::string_view box = "NSBox";
inline constexpr std::string_view button = "NSButton";
inline constexpr std::string_view imageView = "NSImageView";
inline constexpr std::string_view popUpButton = "NSPopUpButton";
inline constexpr std::string_view textField = "NSTextField";
inline constexpr std::string_view view = "NSView";
inline constexpr std::string_view window = "NSWindow";

}  // namespace qz::toolkit::class_names
