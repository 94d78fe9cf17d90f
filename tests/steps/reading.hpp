// SPDX-License-Identifier: MIT
// What a user reads of a text.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace qz::meaning {

/// A part of a text that looks the same.
struct Span {
  std::string text{};
  bool isBold = false;
  bool isItalic = false;
  std::string link{};  ///< where it leads; empty: nowhere

  friend bool operator==(const Span&, const Span&) = default;
};

using Reading = std::vector<Span>;  ///< no two neighbours look the same; none is empty

/// Appends to the reading, so that this remains true.
void append(Reading& reading, const Span& span);

/// Reads the Markdown of one paragraph: emphasis, strong emphasis, links, escaped characters.
Reading readMarkdown(std::string_view rest);

/// Reads HTML with the tags b, i and a, and the references that begin with &amp; &lt; or &eacute;
Reading readHtml(std::string_view rest);

}  // namespace qz::meaning
