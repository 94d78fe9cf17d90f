// SPDX-License-Identifier: MIT
// Finds the file of an image by its name in a script, for any toolkit.
#pragma once

#include <array>
#include <optional>
#include <string>
#include <string_view>

#include "qz/toolkit/system_files.hpp"

namespace qz::toolkit {

/// The suffixes of image formats, in the order in which they are tried after a name without one.
inline constexpr std::array<std::string_view, 9> imageSuffixes = {
    "png", "jpg", "jpeg", "gif", "tiff", "tif", "bmp", "icns", "pdf"};

/// Returns the path of the image file in `directory` that `name` means: the file of exactly that
/// name if it ends in an image suffix, in upper or lower case; otherwise the first existing file of
/// the name with a suffix appended. Absent if there is none. A name is not a path: an empty name,
/// ".." and a name with a separator find nothing. `isFile` says which paths are files.
std::optional<std::string> imageFileNamed(std::string_view name, std::string_view directory,
                                          bool (*isFile)(std::string_view path) = isRegularFile);

}  // namespace qz::toolkit
