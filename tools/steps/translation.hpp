// SPDX-License-Identifier: MIT
// Translations of a source, from the files beside it.
#pragma once

#include <string>
#include <vector>

#include "tools/steps/source.hpp"

namespace qz::tools::steps {

/// Returns the translations in the file LANGUAGE.po beside the source; for the language "x-long",
/// every text made longer. Throws a Failure if the file cannot be read or is not such a file.
Translate translationTo(const std::string& language, const std::string& source);

/// Says of each text of the source that stays as it is in the language: where it is, in which step
/// and control, and why.
std::vector<std::string> untranslated(const Source& source, const std::string& language);

}  // namespace qz::tools::steps
