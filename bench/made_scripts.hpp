// SPDX-License-Identifier: MIT
// Generates scripts to measure with, shaped like real ones: under each tag a list of commands with
// texts, tags and numbers.
#pragma once

#include <cstddef>
#include <string>

namespace qz::bench {

/// Returns a script as XML, about `bytes` bytes long; always the same one for the same size.
std::string xmlScript(std::size_t bytes);

}  // namespace qz::bench
