// SPDX-License-Identifier: MIT
#include "toolkit/exception.hpp"

namespace toolkit {

void raiseUnrecognizedSelector(std::string_view className, std::string_view selector) {
  throw InvalidArgumentException("-[" + std::string(className) + " " + std::string(selector) +
                                 "]: unrecognized selector sent to instance");
}

}  // namespace toolkit
