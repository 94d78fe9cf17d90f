// SPDX-License-Identifier: MIT
// The encoding of XML and old-style property lists: found out, and turned into UTF-8.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "toolkit/property_list/refusal.hpp"

namespace toolkit {

/// A file's text as UTF-8. UTF-8 is not copied and not checked: readers check what they use.
struct DecodedText {
  std::string converted;   ///< the text, of files in another encoding
  std::string_view bytes;  ///< what follows the byte order mark, of files in UTF-8
  bool isConverted = false;
  /// Why the file has no text; the offset is one in what was converted up to there.
  std::optional<RefusedAt> refusal;

  std::string_view text() const { return isConverted ? std::string_view(converted) : bytes; }
};

/// `file` must outlive what this returns.
DecodedText decodeText(std::string_view file);

}  // namespace toolkit
