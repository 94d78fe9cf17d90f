// SPDX-License-Identifier: MIT
// The HTML reader: styled text from HTML 4.01.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/fonts.hpp"

namespace toolkit {

/// The styled text that `bytes`, an HTML document or a fragment of one, stands for. Bytes beyond
/// ASCII are read as browsers read ISO-8859-1, that is as Windows-1252.
///
/// Without a font of its own text is in Times, 12 points; faces that `fonts` lacks are passed over.
/// A colour is set only where the document asks for one: links have one by default, and the body's
/// background colours the page, which is no attribute of the text.
///
/// No markup is wrong: whatever is unclosed, stray or misnested is read as a browser would. Time
/// and memory are proportional to the input. Absent only when there is nothing to read; a document
/// with an empty body is an empty text.
std::optional<AttributedString> attributedStringFromHTML(std::string_view bytes,
                                                         const Fonts& fonts);

}  // namespace toolkit
