// SPDX-License-Identifier: MIT
// Files of translations in gettext's format PO. The library of gettext is not used because its
// licence would become that of the tool.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace qz::tools::steps {

struct PoEntry {
  std::string text{};                     ///< msgid
  std::string translation{};              ///< msgstr; empty: there is none
  bool isFuzzy = false;                   ///< the text has changed since it was translated
  std::vector<std::string> comments{};    ///< for translators
  std::vector<std::string> references{};  ///< such as "tour.yaml:12"
};

/// Returns the entries of a file, without its header. Skips what is obsolete. Throws a Failure,
/// which names `path` and the line, if the text is not such a file.
std::vector<PoEntry> readPo(std::string_view text, const std::string& path);

/// Returns a template for translators: a whole file, with a header and without translations.
std::string writePoTemplate(const std::vector<PoEntry>& entries, const std::string& project);

}  // namespace qz::tools::steps
