// SPDX-License-Identifier: MIT
// Reports a failed check: prints it and ends the program, so that libFuzzer keeps the input.
#pragma once

#include <cstdio>
#include <cstdlib>
#include <string>

namespace qz::fuzz {

inline void require(bool holds, const std::string& what) {
  if (holds) return;
  std::fprintf(stderr, "this does not hold: %s\n", what.c_str());
  std::abort();
}

}  // namespace qz::fuzz
