// SPDX-License-Identifier: MIT
// How the readers of the formats say, among themselves, that a file is not what they read.
#pragma once

#include <cstddef>
#include <string>

namespace toolkit {

/// Thrown by a reader: what it could not accept, and at which byte of the text that it was given.
struct RefusedAt {
  std::size_t offset;
  std::string reason;
};

}  // namespace toolkit
