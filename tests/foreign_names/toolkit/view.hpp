// SPDX-License-Identifier: MIT
// A header of the host, with a name that the project uses too.
#pragma once

namespace toolkit {

class View {
 public:
  int number() const { return 10; }
};

}  // namespace toolkit
