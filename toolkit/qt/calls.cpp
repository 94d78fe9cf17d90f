// SPDX-License-Identifier: MIT
// The default handling of exceptions.

#include "toolkit/qt/calls.hpp"

#include "toolkit/exception.hpp"

namespace toolkit::qt {

Calls::Calls(Log& log)
    : handler_([&log](const std::exception_ptr& thrown) {
        try {
          std::rethrow_exception(thrown);
        } catch (const Exception& exception) {
          log.write(exception.name() + ": " + exception.reason());
        }
      }) {}

}  // namespace toolkit::qt
