// SPDX-License-Identifier: MIT
// Calls back into the application from a platform's event handlers, which must not let exceptions
// through.
#pragma once

#include <exception>
#include <functional>
#include <utility>

#include "qz/api.hpp"
#include "qz/toolkit/log.hpp"

namespace qz::toolkit {

/// Makes calls from a platform's event loop, through which no exception may pass.
class QZ_API Calls {
 public:
  /// Receives the exception that a callback threw. An exception from the handler ends the program.
  using Handler = std::function<void(std::exception_ptr)>;

  /// By default a toolkit exception is logged and the application continues, as AppKit's does; any
  /// other exception ends the program with its own message.
  explicit Calls(Log& log);
  /// Sets who gets the exceptions of calls.
  void setHandler(Handler handler) { handler_ = std::move(handler); }

  /// Makes the call, and hands its exception to the handler.
  template <class Call>
  void make(Call call) noexcept {
    try {
      call();
    } catch (...) {
      const Handler handler = handler_;  // a copy: the handler may replace itself
      handler(std::current_exception());
    }
  }

 private:
  Handler handler_;
};

}  // namespace qz::toolkit
