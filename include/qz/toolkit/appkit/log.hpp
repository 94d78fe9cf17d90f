// SPDX-License-Identifier: MIT
// The AppKit toolkit's log.
#pragma once

#include <functional>
#include <string_view>
#include <utility>

#include "qz/api.hpp"
#include "qz/toolkit/log.hpp"

namespace qz::toolkit::appkit {

/// A log that writes with `NSLog`.
class QZ_API AppKitLog final : public Log {
 public:
  /// Receives a line without its end.
  using Sink = std::function<void(std::string_view)>;

  /// Writes to the sink; without one, with `NSLog`.
  void write(std::string_view line) override;
  /// Sets who gets the lines; without a function, `NSLog` does.
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  Sink sink_;
};

}  // namespace qz::toolkit::appkit
