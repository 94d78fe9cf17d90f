// SPDX-License-Identifier: MIT
// The operations that all contenders of bench-running perform, one for each command.
#pragma once

#include <string>
#include <vector>

#include "qz/toolkit/tag.hpp"

namespace qz::bench {

enum class What { text, title, toolTip, enable, disable, stateOn };

/// One command: an operation on the control with the tag. `text` is used only by operations with
/// text.
struct Operation {
  What what;
  toolkit::Tag tag;
  std::string text;
};

}  // namespace qz::bench
