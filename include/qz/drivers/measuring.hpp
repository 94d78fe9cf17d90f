// SPDX-License-Identifier: MIT
// What drivers can do whose toolkit lays texts out.
#pragma once

#include "qz/api.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::drivers {

/// How much larger a control would have to be.
struct QZ_API MissingRoom {
  double width = 0;   ///< in points; 0: it is wide enough
  double height = 0;  ///< in points; 0: it is high enough

  friend bool operator==(const MissingRoom&, const MissingRoom&) = default;
};

/// A driver may be one of these too: `dynamic_cast` says so.
class QZ_API Measuring {
 public:
  virtual ~Measuring() = default;

  /// Keeps all windows off the screen that this program shows from now on, as long as the driver
  /// lives.
  virtual void workOffScreen() = 0;
  /// Returns how much room the text or title of a view lacks, as its toolkit lays it out in the
  /// view's fonts. None is missing in a view without a text.
  virtual MissingRoom missingRoom(const toolkit::Ref<toolkit::View>& view) = 0;
};

}  // namespace qz::drivers
