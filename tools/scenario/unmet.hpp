// SPDX-License-Identifier: MIT
// What ends a scenario early.
#pragma once

#include <stdexcept>
#include <string>

namespace tools::scenario {

/// Something that a statement needs or states is not so.
class Unmet : public std::runtime_error {
 public:
  Unmet(const std::string& expected, const std::string& got)
      : std::runtime_error("expected " + expected + ", got " + got) {}
};

}  // namespace tools::scenario
