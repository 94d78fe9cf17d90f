// SPDX-License-Identifier: MIT
// Detects the encoding of XML and old-style property lists, and converts it to UTF-8.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "qz/property_list/refusal.hpp"

namespace qz::toolkit {

/// A file's text as UTF-8. UTF-8 files are not copied or checked: readers check the parts they use.
struct DecodedText {
  std::string converted;   ///< the text of a file in another encoding
  std::string_view bytes;  ///< the text of a file in UTF-8, after the byte order mark
  bool isConverted = false;
  /// Why the file has no text; the offset counts in the text converted so far.
  std::optional<RefusedAt> refusal;

  std::string_view text() const { return isConverted ? std::string_view(converted) : bytes; }
};

/// Decodes a whole file. `file` must outlive the result.
DecodedText decodeText(std::string_view file);

}  // namespace qz::toolkit
