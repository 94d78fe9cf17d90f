// SPDX-License-Identifier: MIT
// How a fuzzer says that something does not hold: it prints what, and ends the program, for which
// libFuzzer keeps the input.
#pragma once

#include <cstdio>
#include <cstdlib>
#include <string>

namespace fuzz {

inline void require(bool holds, const std::string& what) {
  if (holds) return;
  std::fprintf(stderr, "this does not hold: %s\n", what.c_str());
  std::abort();
}

}  // namespace fuzz
