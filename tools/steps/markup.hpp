// SPDX-License-Identifier: MIT
// Texts of a source, as commands take them.
#pragma once

#include <string>
#include <string_view>

namespace qz::tools::steps {

/// A text as a control shows it.
struct Markup {
  bool isPlain = true;
  std::string text{};  ///< plain text, or a fragment of HTML in ASCII
};

/// Reads Markdown: emphasis, links, lists, headings and line breaks. The result is plain if the
/// text is one paragraph without any of these. HTML in the text is shown as it is written.
Markup readMarkdown(std::string_view text);

/// Returns plain text as a fragment of HTML in ASCII.
std::string asHtml(std::string_view plain);

/// Returns HTML in ASCII: other characters become references.
std::string inAscii(std::string_view html);

}  // namespace qz::tools::steps
