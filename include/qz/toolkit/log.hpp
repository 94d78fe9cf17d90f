// SPDX-License-Identifier: MIT
// The log: where diagnostic lines go (`NSLog` on macOS).
#pragma once

#include <string_view>

#include "qz/api.hpp"

namespace qz::toolkit {

/// Writes diagnostic lines.
class QZ_API Log {
 public:
  virtual ~Log() = default;

  /// Writes one line, passed without its line end. Lines have no levels.
  virtual void write(std::string_view line) = 0;
};

}  // namespace qz::toolkit
