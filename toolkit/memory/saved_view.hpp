// SPDX-License-Identifier: MIT
// What a view of the memory toolkit shows and how it reacts, as a value that can be kept, compared
// and put back.
#pragma once

#include <optional>
#include <string>

#include "qz/styled_text/attributed_string.hpp"
#include "qz/toolkit/image.hpp"
#include "qz/toolkit/view.hpp"

namespace qz::toolkit::memory {

/// Everything of a view that commands and presses can change. The fields of roles that the view
/// does not have keep their defaults. Subviews, frame, target and action are not saved.
struct SavedView {
  Tag tag = 0;
  bool hidden = false;
  bool enabled = true;
  std::string toolTip{};
  bool wantsLayer = false;
  Ref<Image> layerContents{};
  AttributedString text{};   ///< of a control that is not a button
  AttributedString title{};  ///< of a button
  State state = State::off;
  bool highlighted = false;
  std::optional<Color> background{};  ///< of a button
  BezelStyle bezel = BezelStyle::rounded;
  Ref<Image> image{};  ///< of an image view
  ImageFrameStyle frameStyle = ImageFrameStyle::none;
  ImageScaling scaling = ImageScaling::proportionallyDown;
  ImageAlignment imageAlignment = ImageAlignment::center;

  friend bool operator==(const SavedView&, const SavedView&) = default;
};

}  // namespace qz::toolkit::memory
