// SPDX-License-Identifier: MIT
// The standard names of the classes of windows and views, as scripts' descriptions and scenarios
// spell them. A toolkit may have other names.
#pragma once

#include <string_view>

namespace qz::toolkit::class_names {

inline constexpr std::string_view box = "NSBox";              ///< of a box that groups views
inline constexpr std::string_view button = "NSButton";        ///< of every button, check boxes too
inline constexpr std::string_view imageView = "NSImageView";  ///< of an image view
inline constexpr std::string_view popUpButton = "NSPopUpButton";  ///< of a pop-up button
inline constexpr std::string_view textField = "NSTextField";      ///< of a text field
inline constexpr std::string_view view = "NSView";                ///< of a plain view
inline constexpr std::string_view window = "NSWindow";            ///< of a window

}  // namespace qz::toolkit::class_names
