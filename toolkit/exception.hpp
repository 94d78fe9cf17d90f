// SPDX-License-Identifier: MIT
// The toolkit's exceptions: what a misuse raises (a message that is not understood, a position
// beyond an array's end, an absent argument). Only these are caught by whoever runs commands;
// anything else, std::bad_alloc among them, passes through.
#pragma once

#include <exception>
#include <string>
#include <string_view>
#include <utility>

namespace toolkit {

/// A raised exception, after Foundation's `NSException`.
class Exception : public std::exception {
 public:
  Exception(std::string name, std::string reason)
      : name_(std::move(name)), reason_(std::move(reason)) {}

  /// The kind, such as "NSRangeException".
  const std::string& name() const { return name_; }
  /// What happened, in one line; also what a log line shows of the exception.
  const std::string& reason() const { return reason_; }
  const char* what() const noexcept override { return reason_.c_str(); }

 private:
  std::string name_;
  std::string reason_;
};

/// A position or range outside of what there is.
class RangeException : public Exception {
 public:
  explicit RangeException(std::string reason) : Exception("NSRangeException", std::move(reason)) {}
};

/// An argument that is absent or of the wrong kind, or a message its receiver does not understand.
class InvalidArgumentException : public Exception {
 public:
  explicit InvalidArgumentException(std::string reason)
      : Exception("NSInvalidArgumentException", std::move(reason)) {}
};

/// Raises: an object of class `className` was sent `selector`, which it does not understand.
[[noreturn]] void raiseUnrecognizedSelector(std::string_view className, std::string_view selector);

}  // namespace toolkit
