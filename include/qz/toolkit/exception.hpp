// SPDX-License-Identifier: MIT
// The toolkit's exceptions, raised on misuse: a message that its receiver does not understand, a
// position beyond an array's end, an absent argument. The engine catches only these when it runs
// commands; anything else, such as std::bad_alloc, passes through.
#pragma once

#include <exception>
#include <string>
#include <string_view>
#include <utility>

#include "qz/api.hpp"

namespace qz::toolkit {

/// A raised exception, modelled on Foundation's `NSException`.
class QZ_API Exception : public std::exception {
 public:
  /// Makes an exception of that kind.
  Exception(std::string name, std::string reason)
      : name_(std::move(name)), reason_(std::move(reason)) {}

  /// The kind, such as "NSRangeException".
  const std::string& name() const { return name_; }
  /// What happened, in one line; log lines show this text.
  const std::string& reason() const { return reason_; }
  /// Returns the reason.
  const char* what() const noexcept override { return reason_.c_str(); }

 private:
  std::string name_;
  std::string reason_;
};

/// A position or range is out of bounds.
class QZ_API RangeException : public Exception {
 public:
  /// Makes an exception with that reason.
  explicit RangeException(std::string reason) : Exception("NSRangeException", std::move(reason)) {}
};

/// An argument is absent or of the wrong kind, or a receiver does not understand a message.
class QZ_API InvalidArgumentException : public Exception {
 public:
  /// Makes an exception with that reason.
  explicit InvalidArgumentException(std::string reason)
      : Exception("NSInvalidArgumentException", std::move(reason)) {}
};

/// Raises an InvalidArgumentException: an object of class `className` does not understand
/// `selector`.
[[noreturn]] inline void raiseUnrecognizedSelector(std::string_view className,
                                                   std::string_view selector) {
  throw InvalidArgumentException("-[" + std::string(className) + " " + std::string(selector) +
                                 "]: unrecognized selector sent to instance");
}

}  // namespace qz::toolkit
