// SPDX-License-Identifier: MIT
// A header of the host, with a name that the project uses too.
#pragma once

namespace tools {

class Failure {
 public:
  int number() const { return 30; }
};

}  // namespace tools
