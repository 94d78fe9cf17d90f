// SPDX-License-Identifier: MIT
// A toolkit: the roles through which the engine reaches its platform, in one hand.
#pragma once

#include <optional>
#include <string_view>

#include "toolkit/application.hpp"
#include "toolkit/files.hpp"
#include "toolkit/image.hpp"
#include "toolkit/log.hpp"
#include "toolkit/run_loop.hpp"
#include "toolkit/styled_text/attributed_string.hpp"
#include "toolkit/styled_text/fonts.hpp"

namespace toolkit {

/// Handed to an engine at its construction; outlives every engine that runs on it. All of it is
/// used on one thread, the application's event thread.
class Toolkit {
 public:
  virtual ~Toolkit() = default;

  virtual Application& application() = 0;
  virtual RunLoop& runLoop() = 0;
  virtual Images& images() = 0;
  virtual Fonts& fonts() = 0;
  virtual Files& files() = 0;
  virtual Log& log() = 0;

  /// The text of an HTML document; absent when it cannot be read. A platform that reads HTML itself
  /// does so here; others get the reader in styled_text/.
  virtual std::optional<AttributedString> attributedStringWithHTML(std::string_view document);
};

}  // namespace toolkit
