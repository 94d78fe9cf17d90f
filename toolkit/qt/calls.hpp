// SPDX-License-Identifier: MIT
// Calling the application back out of Qt's event handlers, through which no exception may travel.
#pragma once

#include <exception>
#include <functional>
#include <utility>

#include "toolkit/log.hpp"

namespace toolkit::qt {

class Calls {
 public:
  /// Is handed what a call back threw. What it throws itself ends the program.
  using Handler = std::function<void(std::exception_ptr)>;

  /// Until another handler is set, a toolkit exception is logged and the application goes on, as
  /// AppKit's does; anything else ends the program with its own message.
  explicit Calls(Log& log);
  void setHandler(Handler handler) { handler_ = std::move(handler); }

  template <class Call>
  void make(Call call) noexcept {
    try {
      call();
    } catch (...) {
      const Handler handler = handler_;  // which may replace itself
      handler(std::current_exception());
    }
  }

 private:
  Handler handler_;
};

}  // namespace toolkit::qt
