// SPDX-License-Identifier: MIT
// The crossing of exceptions. The functions below catch only C++ exceptions; `qzRaisedBy` catches
// those of Foundation.

#import "toolkit/foundation/exceptions.hpp"

#include <new>
#include <string>

#import "toolkit/foundation/raised.h"
#import "toolkit/foundation/strings.hpp"

namespace qz::toolkit::foundation {

namespace {

struct GuardedCall {
  const std::function<void()>& body;
  std::exception_ptr thrown;
};

void runGuarded(void* context) {
  auto& call = *static_cast<GuardedCall*>(context);
  try {
    call.body();
  } catch (const std::exception&) {  // not `...`, which would also catch Foundation's exceptions
    call.thrown = std::current_exception();
  }
}

// Returns what `body` throws, as an exception of Foundation; nil if it returns.
NSException* thrownBy(const std::function<void()>& body) {
  try {
    body();
  } catch (const Exception& exception) {
    return nsException(exception);
  } catch (const std::exception& exception) {
    return nsException(exception);
  }
  return nil;
}

}  // namespace

void send(const std::function<void()>& body) {
  GuardedCall call{body, nullptr};
  NSException* const raised = qzRaisedBy(runGuarded, &call);
  if (call.thrown) std::rethrow_exception(call.thrown);
  if (raised) throw Exception(utf8([raised name]), utf8([raised reason]));
}

void answer(const std::function<void()>& body) { [thrownBy(body) raise]; }

NSException* nsException(const Exception& exception) {
  return [NSException exceptionWithName:nsString(exception.name())
                                 reason:nsString(exception.reason())
                               userInfo:nil];
}

NSException* nsException(const std::exception& exception) {
  const bool isMemory = dynamic_cast<const std::bad_alloc*>(&exception) != nullptr;
  return [NSException exceptionWithName:isMemory ? NSMallocException : NSGenericException
                                 reason:nsString(exception.what())
                               userInfo:nil];
}

}  // namespace qz::toolkit::foundation
