// SPDX-License-Identifier: MIT
// The HTML reader: styled text from HTML 4.01.
#pragma once

#include <optional>
#include <string_view>

#include "qz/api.hpp"
#include "qz/styled_text/attributed_string.hpp"
#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit {

/// Returns the styled text of `bytes`, an HTML document or a fragment of one. Bytes beyond ASCII
/// are read as Windows-1252, as browsers do for ISO-8859-1.
///
/// Text without a font is in Times, 12 points; faces that `fonts` lacks are skipped. A colour is
/// set only if the document asks for one: links have one by default. The body's background belongs
/// to the page and is not an attribute of the text.
///
/// No markup is an error: unclosed, stray or misnested tags are read as in a browser. Time and
/// memory are proportional to the input. Absent only if `bytes` is empty; a document with an empty
/// body yields an empty text.
QZ_API std::optional<AttributedString> attributedStringFromHTML(std::string_view bytes,
                                                                const Fonts& fonts);

}  // namespace qz::toolkit
