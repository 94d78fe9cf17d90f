// SPDX-License-Identifier: MIT
// The row of XML property lists.
#include "qz/property_list/xml_writer.hpp"
#include "toolkit/property_list/format_rows.hpp"

namespace qz::toolkit {
namespace {

constexpr std::string_view xmlSuffixes[] = {".plist", ".xml"};

}  // namespace

constexpr FormatRow xmlFormat = {
    .format = Format::xml,
    .name = "xml",
    .title = "XML property list",
    .isText = true,
    .looksLike = looksLikeXml,
    .read = readXml,
    .write = writeXmlPropertyList,
    .writesSharedOnce = false,
    .suffixes = xmlSuffixes,
};

}  // namespace qz::toolkit
