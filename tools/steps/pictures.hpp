// SPDX-License-Identifier: MIT
// Pictures of the steps of a source, which show translators where the texts are.
#pragma once

#include <map>
#include <string>

#include "tools/steps/source.hpp"

namespace qz::tools::steps {

/// Writes a picture of every step to a directory, which is made if there is none. Returns the file
/// names by the steps' names. Throws a Failure if this build cannot draw, or a picture cannot be
/// written.
std::map<std::string, std::string> writePictures(const Source& source,
                                                 const std::string& directory);

}  // namespace qz::tools::steps
