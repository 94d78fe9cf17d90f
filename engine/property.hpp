// Property: a field of the engine that any thread may get or replace while the engine runs on its
// own.
//
// Invariant: whatever is read of a field, by `get` or by the engine itself, stays valid to the end
// of the expression that reads it, whoever replaces the field at the same moment.
#pragma once

#include <functional>
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

  /// What `question` answers of the value, which it must not keep; from any thread.
  template <class Question>
  auto ask(Question question) const {
    const std::lock_guard lock(mutex_);
    return std::invoke(question, value_);
  }

  /// Replaces the value; from any thread. The old one is let go outside of the lock, for its end
  /// may run code that comes back here.
  void set(T value) {
    const std::lock_guard lock(mutex_);
    std::swap(value_, value);
  }

  /// The same as `get`, as the engine writes it.
  T operator*() const { return get(); }
  /// What the value refers to, where it is a reference; else the value.
  auto operator->() const {
    if constexpr (requires(const T& value) { value.operator->(); }) {
      return get();
    } else {
      return Held{get()};
    }
  }

 private:
  struct Held {
    T value;
    const T* operator->() const { return &value; }
  };

  mutable std::mutex mutex_;
  T value_{};
};
