// SPDX-License-Identifier: MIT
// Property: a field of the engine that any thread may get or replace while the engine runs on its
// own.
//
// Invariant: whatever is read of a field, by `get` or by the engine itself, stays valid to the end
// of the expression that reads it, whoever replaces the field at the same moment.
#pragma once

#include <mutex>
#include <utility>

#include "engine/spin_lock.hpp"

template <class T>
class Property {
 public:
  /// The value; from any thread.
  T get() const {
    const std::lock_guard guard(lock_);
    return value_;
  }

  /// The answer of the value, which is not copied, to a question of its own; from any thread.
  template <class Answer>
  Answer ask(Answer (T::*question)() const) const {
    const std::lock_guard guard(lock_);
    return (value_.*question)();
  }

  /// Replaces the value; from any thread. The old one is let go outside of the lock, for its end
  /// may run code that comes back here.
  void set(T value) {
    const std::lock_guard guard(lock_);
    std::swap(value_, value);
  }

  /// The same as `get`, as the engine writes it.
  T operator*() const { return get(); }
  /// What the value, a reference, refers to.
  T operator->() const { return get(); }

 private:
  mutable SpinLock lock_;
  T value_{};
};
