// SPDX-License-Identifier: MIT
// The exception that ends a scenario early.
#pragma once

#include <stdexcept>
#include <string>

namespace qz::tools::scenario {

/// Thrown if something that a statement needs or expects is not so.
class Unmet : public std::runtime_error {
 public:
  Unmet(const std::string& expected, const std::string& got)
      : std::runtime_error("expected " + expected + ", got " + got) {}
};

}  // namespace qz::tools::scenario
