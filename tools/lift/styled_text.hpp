// SPDX-License-Identifier: MIT
// Styled text as an author would write it.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "qz/styled_text/attributed_string.hpp"
#include "tools/steps/tour.hpp"

namespace qz::tools::lift {

/// Returns plain text as Markdown that means just it; absent if there is none.
std::optional<std::string> asMarkdown(const std::string& plain);

/// Returns styled text as Markdown; absent if it has more than bold, italic and links. The font is
/// not said.
std::optional<std::string> asMarkdown(const toolkit::AttributedString& text);

/// Returns styled text as a fragment of HTML. Of the font only what is not in `font` is said, of
/// paragraphs nothing.
std::string asHtml(const toolkit::AttributedString& text, const std::optional<steps::Font>& font);

/// Returns the fonts of the text by the names that commands take, the first one first.
std::vector<steps::Font> fontsOf(const toolkit::AttributedString& text);

}  // namespace qz::tools::lift
