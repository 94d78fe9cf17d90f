// SPDX-License-Identifier: MIT
// The memory toolkit's log: hands each line to the host's sink, or writes it to standard error.
#pragma once

#include <cstdio>
#include <functional>
#include <string_view>
#include <utility>

#include "toolkit/log.hpp"

namespace toolkit::memory {

class MemoryLog final : public Log {
 public:
  using Sink = std::function<void(std::string_view)>;

  /// To the sink; without one, to standard error: a host without a display is a host.
  void write(std::string_view line) override {
    const Sink sink = sink_;  // which may replace itself
    sink ? sink(line) : writeToStandardError(line);
  }
  /// An absent sink is none.
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  static void writeToStandardError(std::string_view line) {
    std::fwrite(line.data(), 1, line.size(), stderr);
    std::fputc('\n', stderr);
  }

  Sink sink_;
};

}  // namespace toolkit::memory
