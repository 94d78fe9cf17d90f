// SPDX-License-Identifier: MIT
// Scripts to measure with, in the shape of real ones: lists under tags, of commands with texts,
// tags and numbers.
#pragma once

#include <cstddef>
#include <string>

namespace bench {

/// A script as XML, of about `bytes` bytes; the same one for the same size.
std::string xmlScript(std::size_t bytes);

}  // namespace bench
