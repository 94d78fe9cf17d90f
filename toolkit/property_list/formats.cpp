// SPDX-License-Identifier: MIT
// The table of formats, made of the constants that the files of the formats define.
#include "qz/property_list/formats.hpp"

#include <algorithm>

#include "toolkit/property_list/format_rows.hpp"

namespace qz::toolkit {

std::span<const FormatRow> formats() {
  static const FormatRow rows[] = {
#define QZ_FORMAT(name, value) name##Format,
#include "qz/property_list/formats.inc"
#undef QZ_FORMAT
  };
  return rows;
}

const FormatRow& formatRow(Format format) {
  return *std::ranges::find(formats(), format, &FormatRow::format);
}

std::string_view description(Format format) { return formatRow(format).title; }

}  // namespace qz::toolkit
