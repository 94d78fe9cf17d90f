// SPDX-License-Identifier: MIT
// The memory toolkit's log: passes each line to the host's sink, or writes it to standard error.
#pragma once

#include <cstdio>
#include <functional>
#include <string_view>
#include <utility>

#include "qz/api.hpp"
#include "qz/toolkit/log.hpp"

namespace qz::toolkit::memory {

/// Writes lines to standard error, or to a sink.
class QZ_API MemoryLog final : public Log {
 public:
  using Sink = std::function<void(std::string_view)>;  ///< takes a line, without its end

  /// Writes to the sink or, without one, to standard error, as a host without a display expects.
  void write(std::string_view line) override {
    const Sink sink = sink_;  // a copy: the sink may replace itself
    sink ? sink(line) : writeToStandardError(line);
  }
  /// An empty function removes the sink.
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  static void writeToStandardError(std::string_view line) {
    std::fwrite(line.data(), 1, line.size(), stderr);
    std::fputc('\n', stderr);
  }

  Sink sink_;
};

}  // namespace qz::toolkit::memory
