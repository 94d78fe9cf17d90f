// SPDX-License-Identifier: MIT
// The Qt toolkit's log.
#pragma once

#include <functional>
#include <string_view>
#include <utility>

#include "qz/api.hpp"
#include "qz/toolkit/log.hpp"

namespace qz::toolkit::qt {

/// Writes lines to Qt's message handler, or to a sink.
class QZ_API QtLog final : public Log {
 public:
  using Sink = std::function<void(std::string_view)>;  ///< takes a line, without its end

  /// Writes to the sink; without one, to Qt's message handler as an info message of the category
  /// "qz.walkthrough".
  void write(std::string_view line) override;
  /// Passes lines to `sink` instead; null for Qt's message handler.
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  Sink sink_;
};

}  // namespace qz::toolkit::qt
