// SPDX-License-Identifier: MIT
// The row of binary property lists.
#include "qz/property_list/binary_writer.hpp"
#include "toolkit/property_list/format_rows.hpp"

namespace qz::toolkit {
namespace {

constexpr std::string_view binarySuffixes[] = {".bplist", ".bin"};

}  // namespace

constexpr FormatRow binaryFormat = {
    .format = Format::binary,
    .name = "binary",
    .title = "binary property list",
    .isText = false,
    .looksLike = looksLikeBinary,
    .read = readBinary,
    .write = writeBinaryPropertyList,
    .writesSharedOnce = true,
    .suffixes = binarySuffixes,
};

}  // namespace qz::toolkit
