// SPDX-License-Identifier: MIT
// A toolkit: bundles the interfaces through which the engine reaches its platform.
#pragma once

#include <optional>
#include <string_view>

#include "qz/api.hpp"
#include "qz/styled_text/attributed_string.hpp"
#include "qz/styled_text/fonts.hpp"
#include "qz/toolkit/application.hpp"
#include "qz/toolkit/files.hpp"
#include "qz/toolkit/image.hpp"
#include "qz/toolkit/log.hpp"
#include "qz/toolkit/run_loop.hpp"

namespace qz::toolkit {

/// Passed to an engine at its construction; must outlive every engine that uses it. All of it is
/// used on one thread, the application's event thread.
class QZ_API Toolkit {
 public:
  virtual ~Toolkit() = default;

  /// Returns what makes windows and controls, and shows sheets.
  virtual Application& application() = 0;
  /// Returns what schedules timers.
  virtual RunLoop& runLoop() = 0;
  /// Returns what finds images by name.
  virtual Images& images() = 0;
  /// Returns what finds fonts by name.
  virtual Fonts& fonts() = 0;
  /// Returns what reads files, and knows the resource directory.
  virtual Files& files() = 0;
  /// Returns what writes diagnostic lines.
  virtual Log& log() = 0;

  /// Converts an HTML document to styled text; absent if it cannot be read. A platform that has an
  /// HTML reader overrides this; the default is the reader in styled_text/.
  virtual std::optional<AttributedString> attributedStringWithHTML(std::string_view document);
};

}  // namespace qz::toolkit
