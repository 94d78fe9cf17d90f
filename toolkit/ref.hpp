// SPDX-License-Identifier: MIT
// Reference that may be absent: the one place where "absent is not an error" lives.
//
// Every type T that is referred to this way has a static `T& nothing()`: an object that accepts
// every message, does nothing and answers zero, NO or absent. `->` on an absent reference reaches
// it, so callers send messages without asking first. Test for absence only where behaviour asks.
#pragma once

#include <cstddef>
#include <memory>
#include <type_traits>
#include <utility>

namespace toolkit {

/// Owning reference to a T, or to nothing. `Pointer` is what owns: `std::shared_ptr` for objects of
/// the toolkit, `Counted` for values (see value.hpp). Two references are equal when they refer to
/// the same object, or both to nothing.
template <class T, template <class> class Pointer = std::shared_ptr>
class Ref {
 public:
  Ref() = default;
  Ref(std::nullptr_t) {}
  Ref(Pointer<T> object) : object_(std::move(object)) {}
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Ref(Pointer<U> object) : object_(std::move(object)) {}
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Ref(const Ref<U, Pointer>& other) : object_(other.pointer()) {}

  explicit operator bool() const { return object_.get() != nullptr; }
  T* operator->() const { return *this ? object_.get() : &T::nothing(); }
  T& operator*() const { return *operator->(); }

  /// The owning pointer itself; null when the reference is absent.
  const Pointer<T>& pointer() const& { return object_; }
  Pointer<T>&& pointer() && { return std::move(object_); }

  friend bool operator==(const Ref& a, const Ref& b) { return a.object_ == b.object_; }

 private:
  Pointer<T> object_;
};

/// Stored reference that says for each object it is given whether it keeps it alive (`own`) or
/// leaves that to somebody else (`refer`); in the latter case it turns absent when the object goes.
template <class T>
class StoredRef {
 public:
  static StoredRef own(const Ref<T>& object) {
    return StoredRef(object.pointer(), object.pointer());
  }
  static StoredRef refer(const Ref<T>& object) { return StoredRef(nullptr, object.pointer()); }
  StoredRef() = default;

  /// The object, or absent when there is none or its owner let it go.
  Ref<T> get() const { return owned_ ? owned_ : referred_.lock(); }

 private:
  StoredRef(std::shared_ptr<T> owned, const std::shared_ptr<T>& referred)
      : owned_(std::move(owned)), referred_(referred) {}

  std::shared_ptr<T> owned_;   // ours to keep alive
  std::weak_ptr<T> referred_;  // its owner's
};

}  // namespace toolkit
