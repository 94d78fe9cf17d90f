// SPDX-License-Identifier: MIT
// What the contenders in running do: the same operations on the same controls, one command each.
#pragma once

#include <string>
#include <vector>

#include "toolkit/tag.hpp"

namespace bench {

enum class What { text, title, toolTip, enable, disable, stateOn };

/// One command: the operation, on the control with the tag; text only where the operation has one.
struct Operation {
  What what;
  toolkit::Tag tag;
  std::string text;
};

}  // namespace bench
