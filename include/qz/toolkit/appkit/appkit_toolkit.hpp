// SPDX-License-Identifier: MIT
// The AppKit toolkit: real windows of macOS or GNUstep. Make it after the host's `NSApplication`,
// and use it only on the main thread. docs/toolkits.md lists its rules.
#pragma once

#include <memory>
#include <optional>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/appkit/application.hpp"
#include "qz/toolkit/appkit/files.hpp"
#include "qz/toolkit/appkit/log.hpp"
#include "qz/toolkit/calls.hpp"
#include "qz/toolkit/clock.hpp"
#include "qz/toolkit/toolkit.hpp"

namespace qz::toolkit::appkit {

/// The toolkit over AppKit.
class QZ_API AppKitToolkit final : public Toolkit {
 public:
  /// Uses the computer's monotonic clock.
  AppKitToolkit();
  /// Uses another clock, which must outlive the toolkit.
  explicit AppKitToolkit(Clock& clock);
  ~AppKitToolkit() override;
  AppKitToolkit(const AppKitToolkit&) = delete;
  AppKitToolkit& operator=(const AppKitToolkit&) = delete;

  AppKitApplication& application() override;
  RunLoop& runLoop() override;
  Images& images() override;
  Fonts& fonts() override;
  AppKitFiles& files() override;
  AppKitLog& log() override;

  /// Uses the platform's HTML reader where it has one, otherwise the one in styled_text/.
  std::optional<AttributedString> attributedStringWithHTML(std::string_view document) override;

  /// Handles exceptions that escape from an action, a timer or a sheet's delegate.
  Calls& calls();

  /// The toolkit's own classes, for its driver.
  struct Parts;
  /// Returns those classes.
  Parts& parts() { return *parts_; }

 private:
  const std::unique_ptr<Parts> parts_;
};

}  // namespace qz::toolkit::appkit
