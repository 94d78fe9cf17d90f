// SPDX-License-Identifier: MIT
// The pre-Unicode encodings that an XML property list may declare.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace qz::toolkit {

/// Converts `bytes` from an encoding to UTF-8 and appends the text. Returns the number of bytes
/// converted; it is less than all if a byte sequence is invalid.
using LegacyDecoder = std::size_t (*)(std::string_view encoding, std::string_view bytes,
                                      std::string& text);

// Names are compared ignoring case and punctuation.

bool isUtf8Name(std::string_view name);
/// Returns the decoder for an encoding by its IANA name or a common alias; null if the name is
/// unknown. Pass the same name to the decoder.
LegacyDecoder legacyDecoder(std::string_view name);

}  // namespace qz::toolkit
