// SPDX-License-Identifier: MIT
// The exception that ends a command early: one line for the user, and the tool's exit status.
#pragma once

#include <stdexcept>
#include <string>

namespace qz::tools {

/// The statuses with which the tool exits.
enum class ExitStatus : int {
  fine = 0,
  failed = 1,    ///< the input was good, but the command did not succeed
  badInput = 2,  ///< bad usage, or a file that is not what it should be
};

/// Thrown by a command that cannot continue. The message is one line without the tool's name and
/// without a line end: where ("FILE:LINE:COLUMN"), what is wrong, and what was expected.
class Failure : public std::runtime_error {
 public:
  Failure(ExitStatus status, const std::string& message)
      : std::runtime_error(message), status_(status) {}

  ExitStatus status() const { return status_; }

 private:
  ExitStatus status_;
};

}  // namespace qz::tools
