// SPDX-License-Identifier: MIT
// The rows of the table of formats, such as xmlFormat; each format defines its own.
#pragma once

#include "qz/property_list/formats.hpp"

namespace qz::toolkit {

#define QZ_FORMAT(name, value) extern const FormatRow name##Format;
#include "qz/property_list/formats.inc"
#undef QZ_FORMAT

}  // namespace qz::toolkit
