// SPDX-License-Identifier: MIT
// Values: the content of property lists and of the engine's tables.
//
// Invariants: a value is shared through counted references. Its address is its identity while a
// reference exists. Values read from a file never change; a reference to one of them keeps all
// values of that file alive (see document.hpp). Only arrays and dictionaries can be mutable, and
// only if made so. Only the counting is thread-safe.
//
// Callers send messages to a value without checking its kind first: a message that its kind does
// not understand raises. `->` on an absent reference answers zero, NO or absent.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <new>
#include <string>
#include <string_view>
#include <utility>

#include "qz/api.hpp"
#include "qz/property_list/document.hpp"
#include "qz/toolkit/ref.hpp"

namespace qz::toolkit {

/// A pointer that shares ownership of a value through the count within the value.
template <class T>
class Counted {
 public:
  Counted() = default;
  /// Takes over a count that the caller owns.
  static Counted adopt(T* value) {
    Counted counted;
    counted.value_ = value;
    return counted;
  }
  /// Adds a count.
  static Counted share(T* value) {
    if (value) value->retain();
    return adopt(value);
  }

  /// Becomes another owner of the object.
  Counted(const Counted& other) : Counted(share(other.value_)) {}
  /// Takes over the ownership.
  Counted(Counted&& other) noexcept : value_(std::exchange(other.value_, nullptr)) {}
  /// Becomes another owner of the object, as its base.
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Counted(const Counted<U>& other) : Counted(share(other.get())) {}
  /// Releases its object, and takes over the other's ownership.
  Counted& operator=(Counted other) noexcept {
    std::swap(value_, other.value_);
    return *this;
  }
  ~Counted() {
    if (value_) value_->release();
  }

  /// Returns the object; null if there is none.
  T* get() const { return value_; }
  /// Returns the object, which must exist.
  T& operator*() const { return *value_; }
  friend bool operator==(const Counted& a, const Counted& b) { return a.value_ == b.value_; }
  friend bool operator==(const Counted& a, std::nullptr_t) { return a.value_ == nullptr; }

 private:
  T* value_ = nullptr;
};

class Value;

/// A counted reference to a value of the named kind, or to nothing.
template <class T = Value>
using ValueRef = Ref<T, Counted>;

/// A value of a property list.
class QZ_API Value {
 public:
  /// What a value is.
  enum class Kind : std::uint8_t {
    nothing,  ///< only for the object behind absent values
    string,
    number,
    date,
    data,
    null,
    uid,
    set,
    array,
    dictionary
  };

  /// Returns the object behind absent values: it answers zero, NO, absent or empty text to every
  /// message.
  static Value& nothing();
  Value(const Value&) = delete;
  Value& operator=(const Value&) = delete;

  /// Returns what the value is.
  Kind kind() const { return kind_; }
  /// Returns the name of the kind for messages, such as "NSString"; empty for an absent value.
  std::string_view className() const;

  // Conversions of strings and numbers; any other kind raises. Strings convert by the rules of
  // number_conversion.hpp. An integer out of range keeps its low bits. A real is truncated; out of
  // range it gives the nearest bound, and NaN gives 0.
  /// Returns the number as 32 bits.
  virtual std::int32_t intValue() const;
  /// Returns the number as 64 bits.
  virtual std::int64_t integerValue() const;
  /// The same as `integerValue`.
  virtual std::int64_t longValue() const;
  /// Returns the number as a real of 32 bits.
  virtual float floatValue() const;
  /// Returns the number as a real of 64 bits.
  virtual double doubleValue() const;
  /// For a number, whether it is not zero.
  virtual bool boolValue() const;

  /// Returns the number of elements of a collection; anything else raises.
  virtual std::size_t count() const;
  /// Returns an element of an array, valid until the array changes. Raises a range exception beyond
  /// its end. Anything else than an array raises.
  virtual const ValueRef<>& objectAtIndex(std::size_t index) const;

  /// True if the contents never change or move while the value lives, as for values read from a
  /// file.
  bool isFixed() const { return keeper_ == Keeper::document; }

  /// Returns the value as readable text, on one line unless a string contains line breaks: a string
  /// as it is, a number in decimal (a boolean as 1 or 0, a real in the fewest digits that read back
  /// the same), a date in ISO 8601, data as `<hex>`, null as `<null>`. Collections are in the old
  /// style, `( a, b )` and `{ k = v; }`, with strings quoted where that style requires it.
  std::string description() const;

  /// Adds an owner.
  void retain() {
    if (keeper_ == Keeper::references) {
      count_.fetch_add(1, std::memory_order_relaxed);
    } else if (keeper_ == Keeper::document) {
      document().retain();
    }
  }
  /// Removes an owner; the last one destroys the value.
  void release() {
    if (keeper_ == Keeper::references) {
      if (count_.fetch_sub(1, std::memory_order_acq_rel) == 1) destroy();
    } else if (keeper_ == Keeper::document) {
      document().release();
    }
  }

 protected:
  /// Makes a value of the kind.
  explicit Value(Kind kind) : kind_(kind) {}
  virtual ~Value() = default;
  /// Releases the memory of a value that no document owns.
  static void operator delete(void* memory) { ::operator delete(memory); }

  /// Returns the one object of class T behind absent references. Never destroyed: destructors at
  /// program exit may still use it.
  template <class T>
  static T& nothingAs() {
    alignas(T) static std::byte storage[sizeof(T)];
    static T& object = *new (storage) T(Kind::nothing);
    return object;
  }

  /// Makes a separate value, with `extra` bytes directly after the object.
  template <class T, class... Arguments>
  static Counted<T> makeAlone(std::size_t extra, Arguments&&... arguments) {
    return Counted<T>::adopt(new (Extra{extra}) T(std::forward<Arguments>(arguments)...));
  }
  /// The same in a document, without its own count.
  template <class T, class... Arguments>
  static T* makeIn(Document& document, std::size_t extra, Arguments&&... arguments) {
    const Document::Place place = document.place(sizeof(T) + extra);
    T* value = new (place.memory) T(std::forward<Arguments>(arguments)...);
    value->keeper_ = Keeper::document;
    value->count_.store(place.distance, std::memory_order_relaxed);
    return value;
  }
  /// The same in memory that lasts until the end of the program; the value is not counted.
  template <class T, class... Arguments>
  static T* makeForever(void* memory, Arguments&&... arguments) {
    T* value = new (memory) T(std::forward<Arguments>(arguments)...);
    value->keeper_ = Keeper::program;
    return value;
  }

  /// Destroys the value after its last reference is gone.
  virtual void destroy() noexcept;
  /// Raises unless the value is absent: absent values understand every message.
  void requireUnderstanding(std::string_view selector) const;

 private:
  /// What keeps the value alive: references to it, references to its document, or nothing (it lives
  /// until the end of the program).
  enum class Keeper : std::uint8_t { references, document, program };
  enum class Extra : std::size_t {};
  static void* operator new(std::size_t size, Extra extra) {
    return ::operator new(size + static_cast<std::size_t>(extra));
  }
  static void* operator new(std::size_t, void* place) { return place; }
  static void operator delete(void* memory, Extra) { ::operator delete(memory); }
  static void operator delete(void*, void*) {}

  Document& document() const {
    const std::size_t distance = count_.load(std::memory_order_relaxed) * Document::unit;
    const auto* block = reinterpret_cast<const std::byte*>(this) - distance;
    return *reinterpret_cast<const Document::Block*>(block)->document;
  }

  // The number of references; in a document, the distance from the start of its block, in units.
  std::atomic<std::uint32_t> count_{1};
  Kind kind_;
  Keeper keeper_ = Keeper::references;
};

/// Whether arrays and dictionaries can change. `ignored` ones, which stand for an absent
/// collection, ignore every change; `immutable` ones raise an invalid-argument exception.
enum class Mutability : std::uint8_t { ignored, immutable, changeable };

}  // namespace qz::toolkit
