// SPDX-License-Identifier: MIT
// Property: a field of the engine that any thread may get or set while the engine runs on its own
// thread.
//
// Invariant: a value read from a field stays valid until the end of the reading expression, even if
// another thread replaces the field meanwhile.
#pragma once

#include <mutex>
#include <utility>

#include "engine/spin_lock.hpp"

namespace qz {

template <class T>
class Property {
 public:
  /// Returns the value. Any thread.
  T get() const {
    const std::lock_guard guard(lock_);
    return value_;
  }

  /// Returns the result of a const member function of the value, without copying the value. Any
  /// thread.
  template <class Answer>
  Answer ask(Answer (T::*question)() const) const {
    const std::lock_guard guard(lock_);
    return (value_.*question)();
  }

  /// Replaces the value. Any thread. The old value is released outside the lock, because its
  /// destructor may run code that uses this property.
  void set(T value) {
    const std::lock_guard guard(lock_);
    std::swap(value_, value);
  }

  /// The same as `get`, as shorthand for the engine.
  T operator*() const { return get(); }
  /// Gives access to the object to which the value, a reference, refers.
  T operator->() const { return get(); }

 private:
  mutable SpinLock lock_;
  T value_{};
};

}  // namespace qz
