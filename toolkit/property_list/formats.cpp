// SPDX-License-Identifier: MIT
// The rows of the table of formats.
#include "qz/property_list/formats.hpp"

#include <algorithm>
#include <cassert>
#include <iterator>

#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/xml_writer.hpp"

namespace qz::toolkit {
namespace {

constexpr std::string_view binarySuffixes[] = {".bplist", ".bin"};
constexpr std::string_view xmlSuffixes[] = {".plist", ".xml"};
constexpr std::string_view oldStyleSuffixes[] = {".strings"};

constexpr FormatRow formatRows[] = {
    {.format = Format::binary,
     .name = "binary",
     .title = "binary property list",
     .isText = false,
     .looksLike = looksLikeBinary,
     .read = readBinary,
     .write = writeBinaryPropertyList,
     .writesSharedOnce = true,
     .suffixes = binarySuffixes},
    {.format = Format::xml,
     .name = "xml",
     .title = "XML property list",
     .isText = true,
     .looksLike = looksLikeXml,
     .read = readXml,
     .write = writeXmlPropertyList,
     .writesSharedOnce = false,
     .suffixes = xmlSuffixes},
    {.format = Format::oldStyle,
     .name = "old-style",
     .title = "old-style property list",
     .isText = true,
     .looksLike = looksLikeOldStyle,
     .read = readOldStyle,
     .write = nullptr,
     .writesSharedOnce = false,
     .suffixes = oldStyleSuffixes},
};

static_assert(std::rbegin(formatRows)->isText,
              "a text that looks like no other format is of the last");

}  // namespace

std::span<const FormatRow> formats() { return formatRows; }

const FormatRow& formatRow(Format format) {
  const auto* const row = std::find_if(std::begin(formatRows), std::end(formatRows),
                                       [&](const FormatRow& one) { return one.format == format; });
  assert(row != std::end(formatRows));
  return *row;
}

std::string_view description(Format format) { return formatRow(format).title; }

}  // namespace qz::toolkit
