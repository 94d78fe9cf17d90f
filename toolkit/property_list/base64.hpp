// SPDX-License-Identifier: MIT
// Base64, the form of data in text property lists.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace qz::toolkit {

/// Decodes `text` as the platform does and appends the bytes: ASCII characters that are not base64
/// digits are skipped, `=` counts as a digit anywhere, and an incomplete group of four at the end
/// is dropped. Returns the size of `text`, or the position of the first byte from 0x80, where
/// decoding stops.
std::size_t decodeBase64(std::string_view text, std::string& bytes);

/// Appends `bytes` in base64, in lines of at most 68 digits, each starting with `lineStart`.
void encodeBase64(std::string_view bytes, std::string_view lineStart, std::string& text);

}  // namespace qz::toolkit
