// SPDX-License-Identifier: MIT
// Finding the file of an image by the name that scripts write, whatever a toolkit makes of the
// file.
#pragma once

#include <array>
#include <optional>
#include <string>
#include <string_view>

namespace toolkit {

/// The suffixes of image formats, in the order in which a name without one is tried with them.
inline constexpr std::array<std::string_view, 9> imageSuffixes = {
    "png", "jpg", "jpeg", "gif", "tiff", "tif", "bmp", "icns", "pdf"};

/// The path of the image file in `directory` that `name` means: the file of that very name if it
/// carries an image suffix, of any case; else the first that is there of the name with a suffix
/// behind it. A name is no path: one that holds a separator finds nothing, and neither do an empty
/// one and "..".
std::optional<std::string> imageFileNamed(std::string_view name, std::string_view directory);

}  // namespace toolkit
