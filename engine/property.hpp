// Property: a field of the engine that any thread may get or replace while the engine runs on its
// own.
//
// `get` and `set` are atomic: what `get` returns stays valid whoever replaces the field at the same
// moment. The engine itself reads its fields directly, on its own thread, where nobody else writes.
#pragma once

#include <mutex>
#include <utility>

template <class T>
class Property {
 public:
  /// The value; from any thread.
  T get() const {
    const std::lock_guard lock(mutex_);
    return value_;
  }

  /// Replaces the value; from any thread. The old one is let go outside of the lock, for its end
  /// may run code that comes back here.
  void set(T value) {
    const std::lock_guard lock(mutex_);
    std::swap(value_, value);
  }

  /// The value itself; on the engine's thread only, which is the one that replaces it.
  const T& operator*() const { return value_; }
  /// What the value refers to, where it is a reference; else the value.
  auto operator->() const {
    if constexpr (requires { value_.operator->(); }) {
      return value_.operator->();
    } else {
      return &value_;
    }
  }

 private:
  mutable std::mutex mutex_;
  T value_{};
};
