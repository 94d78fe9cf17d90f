// SPDX-License-Identifier: MIT
// Decodes the characters of documents: bytes, and references such as "&eacute;" and "&#233;".
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace qz::toolkit::html {

/// Where a reference is. In an attribute "&copy=1" is part of an address, not a reference.
enum class ReferencePlace { text, attribute };

struct Reference {
  char32_t character = 0;
  std::size_t length = 0;  ///< length in bytes, including "&"
};

/// Returns the reference at the start of `bytes`, which begin with "&"; absent if there is none and
/// they stay as written.
///
/// Knows the 252 entities of HTML 4, whose names are case-sensitive. As in browsers, those of
/// Latin-1 may lack the semicolon. Numbers from 128 to 159 are read as Windows-1252; 0, surrogates
/// and numbers beyond Unicode are read as U+FFFD.
std::optional<Reference> readReference(std::string_view bytes, ReferencePlace place);

/// Returns `bytes` as UTF-8 with references decoded. Bytes beyond ASCII are Windows-1252; drops
/// NUL.
std::string decoded(std::string_view bytes, ReferencePlace place);

/// True if `decoded` would return `bytes` unchanged; does not build the text.
bool isPlain(std::string_view bytes);

}  // namespace qz::toolkit::html
