// SPDX-License-Identifier: MIT
// Who decides when a window or a widget ends.
#pragma once

#include <cstdint>

namespace qz::toolkit {

enum class KeptBy : std::uint8_t {
  host,        ///< the host that made it; the toolkit never ends it
  holder,      ///< ends when nobody holds a reference to it
  application  ///< the same, but the application holds it too while it is on the screen
};

}  // namespace qz::toolkit
