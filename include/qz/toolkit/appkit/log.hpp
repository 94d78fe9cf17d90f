// SPDX-License-Identifier: MIT
// The AppKit toolkit's log.
#pragma once

#include <functional>
#include <string_view>
#include <utility>

#include "qz/toolkit/log.hpp"

namespace qz::toolkit::appkit {

class AppKitLog final : public Log {
 public:
  using Sink = std::function<void(std::string_view)>;

  /// Writes to the sink; without one, with `NSLog`.
  void write(std::string_view line) override;
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  Sink sink_;
};

}  // namespace qz::toolkit::appkit
