// SPDX-License-Identifier: MIT
// The readers of the formats, for the table in formats.hpp.
//
// Each reader makes its values in `document` and returns the root, or throws RefusedAt; after that
// the document is of no use. `offsets`, unless null, receives the position at which each value
// starts.
#pragma once

#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/api.hpp"
#include "qz/property_list/document.hpp"
#include "qz/property_list/refusal.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// Values, including keys, and the byte at which each starts.
using ValueOffsets = std::vector<std::pair<const Value*, std::size_t>>;

/// The limit of nesting, so that no file exhausts the stack: the platform's own limit.
constexpr std::size_t deepestNesting = 512;

/// Whether the file begins as a binary property list. `bytes` is the whole file.
QZ_API bool looksLikeBinary(std::string_view bytes);
/// Makes the values of the file in the document, and returns the root. Notes where each starts,
/// unless `offsets` is null. Throws RefusedAt.
QZ_API Value* readBinary(std::string_view bytes, Document& document, ValueOffsets* offsets);
/// Whether the text was meant as XML. `text` is the file in UTF-8, not checked yet.
QZ_API bool looksLikeXml(std::string_view text);
/// The same for XML.
QZ_API Value* readXml(std::string_view text, Document& document, ValueOffsets* offsets);
/// `text` is the file in UTF-8, not checked yet. Any text looks like this format, even a single
/// word.
QZ_API bool looksLikeOldStyle(std::string_view text);
/// The same for the old style.
QZ_API Value* readOldStyle(std::string_view text, Document& document, ValueOffsets* offsets);

}  // namespace qz::toolkit
