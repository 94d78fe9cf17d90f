// SPDX-License-Identifier: MIT
#include "tools/support/terminal.hpp"

#include <unistd.h>

#include <cstdlib>

namespace qz::tools {

bool outputShowsColor() {
  if (::isatty(STDOUT_FILENO) == 0) return false;
  const char* noColor = std::getenv("NO_COLOR");
  return noColor == nullptr || *noColor == '\0';
}

}  // namespace qz::tools
