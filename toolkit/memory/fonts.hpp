// SPDX-License-Identifier: MIT
// The memory toolkit's fonts: a fixed catalogue, the same on every machine.
#pragma once

#include "qz/styled_text/fonts.hpp"

namespace qz::toolkit::memory {

class MemoryFonts final : public Fonts {
 public:
  std::optional<Font> fontWithName(std::string_view name, double size) const override;
};

}  // namespace qz::toolkit::memory
