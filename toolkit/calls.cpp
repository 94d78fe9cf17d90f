// SPDX-License-Identifier: MIT
// The default handling of exceptions.

#include "qz/toolkit/calls.hpp"

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {

Calls::Calls(Log& log)
    : handler_([&log](const std::exception_ptr& thrown) {
        try {
          std::rethrow_exception(thrown);
        } catch (const Exception& exception) {
          log.write(exception.name() + ": " + exception.reason());
        }
      }) {}

}  // namespace qz::toolkit
