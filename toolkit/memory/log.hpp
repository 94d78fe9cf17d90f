// SPDX-License-Identifier: MIT
// The memory toolkit's log: hands each line to whoever asked for them.
#pragma once

#include <functional>
#include <string_view>
#include <utility>

#include "toolkit/log.hpp"

namespace toolkit::memory {

class MemoryLog final : public Log {
 public:
  using Sink = std::function<void(std::string_view)>;

  /// Without a sink the lines go nowhere.
  void write(std::string_view line) override {
    const Sink sink = sink_;  // which may replace itself
    if (sink) sink(line);
  }
  void setSink(Sink sink) { sink_ = std::move(sink); }

 private:
  Sink sink_;
};

}  // namespace toolkit::memory
