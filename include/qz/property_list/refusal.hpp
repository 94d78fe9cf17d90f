// SPDX-License-Identifier: MIT
// The exception by which the format readers refuse a file; it stays within the readers.
#pragma once

#include <cstddef>
#include <string>

#include "qz/api.hpp"

namespace qz::toolkit {

/// Thrown by a reader: the reason for refusal, and the offset in bytes in the text that it was
/// given.
struct QZ_API RefusedAt {
  std::size_t offset;  ///< in the bytes or the text that the reader got
  std::string reason;  ///< what was expected and found, in words
};

}  // namespace qz::toolkit
