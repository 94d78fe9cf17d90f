// SPDX-License-Identifier: MIT
// Exceptions on their way between C++ and Objective-C. Name and reason stay the same.
//
// Code that sends messages to foreign objects runs in `sending`; a method that Objective-C calls
// runs its C++ in `answering`. So C++ code sees only C++ exceptions, and Objective-C code only
// Foundation's.
#pragma once

#import <Foundation/Foundation.h>

#include <exception>
#include <functional>
#include <optional>
#include <type_traits>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit::foundation {

/// Calls `body`. An exception of Foundation leaves this as a toolkit exception with the same name
/// and reason; a C++ exception leaves it as it is.
void send(const std::function<void()>& body);

/// Calls `body`. A toolkit exception leaves this as an exception of Foundation with the same name
/// and reason; other standard exceptions as one of Foundation's kinds, with their text.
void answer(const std::function<void()>& body);

/// Make a `NSException` of a C++ exception, autoreleased. The second takes any standard exception.
NSException* nsException(const Exception& exception);
NSException* nsException(const std::exception& exception);

/// Like `send`, and returns the result of `body`.
template <class Body>
auto sending(Body body) {
  if constexpr (std::is_void_v<decltype(body())>) {
    send(std::ref(body));
  } else {
    std::optional<decltype(body())> result;
    send([&] { result.emplace(body()); });
    return *std::move(result);
  }
}

/// Like `answer`, and returns the result of `body`.
template <class Body>
auto answering(Body body) {
  if constexpr (std::is_void_v<decltype(body())>) {
    answer(std::ref(body));
  } else {
    std::optional<decltype(body())> result;
    answer([&] { result.emplace(body()); });
    return *std::move(result);
  }
}

}  // namespace qz::toolkit::foundation
