// SPDX-License-Identifier: MIT
// Characters as documents write them: bytes, and references such as "&eacute;" and "&#233;".
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace toolkit::html {

/// Where a reference stands. In an attribute "&copy=1" is part of an address, no reference.
enum class ReferencePlace { text, attribute };

struct Reference {
  char32_t character = 0;
  std::size_t length = 0;  ///< bytes in the document, from "&" on
};

/// The reference that `bytes`, which begin with "&", begin with; absent where they are no
/// reference and stay as written.
///
/// Named are the 252 entities of HTML 4, in their case. The ones of Latin-1 do without the
/// semicolon, as they do in browsers. Numbers from 128 to 159 are meant as Windows-1252; 0,
/// surrogates and what is beyond Unicode read as U+FFFD.
std::optional<Reference> readReference(std::string_view bytes, ReferencePlace place);

/// `bytes` as UTF-8, references read. Bytes beyond ASCII are Windows-1252; NUL is dropped.
std::string decoded(std::string_view bytes, ReferencePlace place);

/// Whether `decoded` gives back `bytes` unchanged, found without building the text.
bool isPlain(std::string_view bytes);

}  // namespace toolkit::html
