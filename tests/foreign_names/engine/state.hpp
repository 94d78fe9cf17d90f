// SPDX-License-Identifier: MIT
// A header of the host, with a name that the project uses too.
#pragma once

namespace engine {

class State {
 public:
  int number() const { return 20; }
};

}  // namespace engine
