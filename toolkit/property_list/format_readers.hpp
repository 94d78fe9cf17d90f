// SPDX-License-Identifier: MIT
// The readers of the three formats, as the one reader in front of them sees them (see reader.hpp).
//
// Each makes its values in `document` and returns the root, or throws RefusedAt; a document whose
// reader has thrown holds nothing of use. `offsets`, unless null, receives where each value starts.
#pragma once

#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

#include "toolkit/property_list/document.hpp"
#include "toolkit/property_list/refusal.hpp"
#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// Values, keys among them, and the byte that each starts at.
using ValueOffsets = std::vector<std::pair<const Value*, std::size_t>>;

/// How deeply collections may nest, so that no file exhausts the stack: the platform's own limit.
constexpr std::size_t deepestNesting = 512;

/// `bytes` is the whole file.
Value* readBinary(std::string_view bytes, Document& document, ValueOffsets* offsets);
/// `text` is the file in UTF-8, not checked yet.
Value* readXml(std::string_view text, Document& document, ValueOffsets* offsets);
/// `text` is the file in UTF-8, not checked yet.
Value* readOldStyle(std::string_view text, Document& document, ValueOffsets* offsets);

}  // namespace toolkit
