// SPDX-License-Identifier: MIT
// Base64, as property lists write data.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace toolkit {

/// Appends the bytes that `text` stands for, as the platform reads it: ASCII that is no digit is
/// skipped, `=` counts as a digit of its own wherever it stands, an incomplete group of four at the
/// end is dropped. Stops at a byte from 0x80 and returns where; otherwise the size of `text`.
std::size_t decodeBase64(std::string_view text, std::string& bytes);

/// Appends `bytes` in base64, in lines of at most 68 digits that each start with `lineStart`.
void encodeBase64(std::string_view bytes, std::string_view lineStart, std::string& text);

}  // namespace toolkit
