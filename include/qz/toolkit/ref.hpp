// SPDX-License-Identifier: MIT
// A reference that may be absent: the one place that implements "absent is not an error".
//
// Every type T used this way has a static `T& nothing()`: an object that accepts every message,
// does nothing and answers zero, NO or absent. `->` on an absent reference reaches this object, so
// callers send messages without a test first. Test for absence only where the behaviour requires
// it.
#pragma once

#include <cstddef>
#include <memory>
#include <type_traits>
#include <utility>

namespace qz::toolkit {

/// An owning reference to a T, or to nothing. `Pointer` is the owning pointer: `std::shared_ptr`
/// for toolkit objects, `Counted` for values (see value.hpp). Two references are equal if they
/// refer to the same object or are both absent.
template <class T, template <class> class Pointer = std::shared_ptr>
class Ref {
 public:
  Ref() = default;
  /// Makes an absent reference.
  Ref(std::nullptr_t) {}
  /// Makes an owner of the object; absent if it is null.
  Ref(Pointer<T> object) : object_(std::move(object)) {}
  /// The same, as a base of the object.
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Ref(Pointer<U> object) : object_(std::move(object)) {}
  /// Makes another owner of the object, as a base of it.
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Ref(const Ref<U, Pointer>& other) : object_(other.pointer()) {}

  /// Whether there is an object.
  explicit operator bool() const { return object_.get() != nullptr; }
  /// Returns the object, or the one that does nothing.
  T* operator->() const { return *this ? object_.get() : &T::nothing(); }
  /// Returns the object, or the one that does nothing.
  T& operator*() const { return *operator->(); }

  /// Returns the owning pointer; null if the reference is absent.
  const Pointer<T>& pointer() const& { return object_; }
  /// Gives the owning pointer away.
  Pointer<T>&& pointer() && { return std::move(object_); }

  friend bool operator==(const Ref& a, const Ref& b) { return a.object_ == b.object_; }

 private:
  Pointer<T> object_;
};

/// A stored reference that either keeps its object alive (`own`) or does not (`refer`); the latter
/// becomes absent when the object is destroyed.
template <class T>
class StoredRef {
 public:
  /// Returns a reference that keeps the object alive.
  static StoredRef own(const Ref<T>& object) {
    return StoredRef(object.pointer(), object.pointer());
  }
  /// Returns a reference that does not keep the object alive.
  static StoredRef refer(const Ref<T>& object) { return StoredRef(nullptr, object.pointer()); }
  StoredRef() = default;

  /// Returns the object; absent if there is none or its owner has released it.
  Ref<T> get() const { return owned_ ? owned_ : referred_.lock(); }

 private:
  StoredRef(std::shared_ptr<T> owned, const std::shared_ptr<T>& referred)
      : owned_(std::move(owned)), referred_(referred) {}

  std::shared_ptr<T> owned_;   // kept alive by this reference
  std::weak_ptr<T> referred_;  // kept alive by its owner
};

}  // namespace qz::toolkit
