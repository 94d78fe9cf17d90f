// SPDX-License-Identifier: MIT
// Values: what property lists hold and tables keep.
//
// Invariants: a value is shared through counted references and has an identity, its address, for as
// long as it is referred to. Values read from a file never change; a reference to one of them keeps
// all of that file's values (see document.hpp). Only arrays and dictionaries can be mutable, and
// only those made so. The counting is safe on any thread, nothing else is.
//
// A value is sent messages without being asked first what it is: what its kind does not understand
// raises. `->` on an absent reference answers zero, NO or absent.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <new>
#include <string>
#include <string_view>
#include <utility>

#include "toolkit/property_list/document.hpp"
#include "toolkit/ref.hpp"

namespace toolkit {

/// Pointer that shares ownership of a value by the count within the value.
template <class T>
class Counted {
 public:
  Counted() = default;
  /// Takes over one count that the caller holds already.
  static Counted adopt(T* value) {
    Counted counted;
    counted.value_ = value;
    return counted;
  }
  /// Adds a count of its own.
  static Counted share(T* value) {
    if (value) value->retain();
    return adopt(value);
  }

  Counted(const Counted& other) : Counted(share(other.value_)) {}
  Counted(Counted&& other) noexcept : value_(std::exchange(other.value_, nullptr)) {}
  template <class U, class = std::enable_if_t<std::is_convertible_v<U*, T*>>>
  Counted(const Counted<U>& other) : Counted(share(other.get())) {}
  Counted& operator=(Counted other) noexcept {
    std::swap(value_, other.value_);
    return *this;
  }
  ~Counted() {
    if (value_) value_->release();
  }

  T* get() const { return value_; }
  T& operator*() const { return *value_; }
  friend bool operator==(const Counted& a, const Counted& b) { return a.value_ == b.value_; }
  friend bool operator==(const Counted& a, std::nullptr_t) { return a.value_ == nullptr; }

 private:
  T* value_ = nullptr;
};

class Value;

/// Counted reference to a value of the kind named, or to nothing.
template <class T = Value>
using ValueRef = Ref<T, Counted>;

class Value {
 public:
  enum class Kind : std::uint8_t {
    nothing,  ///< only of the object that stands for an absent value
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

  /// Stands for an absent value: answers zero, NO, absent or empty text to everything.
  static Value& nothing();
  Value(const Value&) = delete;
  Value& operator=(const Value&) = delete;

  Kind kind() const { return kind_; }
  /// The name of the kind in messages, such as "NSString"; empty for the object that is nothing.
  std::string_view className() const;

  // Conversions, of strings and numbers; any other kind raises. Strings convert by the rules of
  // number_conversion.hpp. An integer out of the result's range keeps its low bits; a real is
  // truncated, and one that is out of range or no number gives the nearest bound, or 0.
  virtual std::int32_t intValue() const;
  virtual std::int64_t integerValue() const;
  /// The same as `integerValue`.
  virtual std::int64_t longValue() const;
  virtual float floatValue() const;
  virtual double doubleValue() const;
  /// Of a number: whether it is other than zero.
  virtual bool boolValue() const;

  /// How many elements a collection has; anything else raises.
  virtual std::size_t count() const;
  /// The element of an array, valid until the array changes; a range exception beyond its end.
  /// Anything but an array raises.
  virtual const ValueRef<>& objectAtIndex(std::size_t index) const;

  /// Whether whatever the value holds stays in place as long as the value is there: so it does of
  /// values read from a file.
  bool isFixed() const { return keeper_ == Keeper::document; }

  /// The value as a person would read it, in one line unless a string in it has more: a string is
  /// itself, a number decimal (a boolean 1 or 0, a real in the fewest digits that read back the
  /// same), a date in ISO 8601, data `<hex>`, null `<null>`. Collections are in the old style,
  /// `( a, b )` and `{ k = v; }`, and the strings in them quoted where that style asks for it.
  std::string description() const;

  void retain() {
    if (keeper_ == Keeper::references) {
      count_.fetch_add(1, std::memory_order_relaxed);
    } else if (keeper_ == Keeper::document) {
      document().retain();
    }
  }
  void release() {
    if (keeper_ == Keeper::references) {
      if (count_.fetch_sub(1, std::memory_order_acq_rel) == 1) destroy();
    } else if (keeper_ == Keeper::document) {
      document().release();
    }
  }

 protected:
  explicit Value(Kind kind) : kind_(kind) {}
  virtual ~Value() = default;
  static void operator delete(void* memory) { ::operator delete(memory); }

  /// The one object of class T that is nothing. It is never destroyed: it is used until the very
  /// end of the program, where other objects' destructors still run.
  template <class T>
  static T& nothingAs() {
    alignas(T) static std::byte storage[sizeof(T)];
    static T& object = *new (storage) T(Kind::nothing);
    return object;
  }

  /// A value of its own that keeps `extra` bytes right behind itself.
  template <class T, class... Arguments>
  static Counted<T> makeAlone(std::size_t extra, Arguments&&... arguments) {
    return Counted<T>::adopt(new (Extra{extra}) T(std::forward<Arguments>(arguments)...));
  }
  /// The same as a part of a document; it has no count of its own.
  template <class T, class... Arguments>
  static T* makeIn(Document& document, std::size_t extra, Arguments&&... arguments) {
    const Document::Place place = document.place(sizeof(T) + extra);
    T* value = new (place.memory) T(std::forward<Arguments>(arguments)...);
    value->keeper_ = Keeper::document;
    value->count_.store(place.distance, std::memory_order_relaxed);
    return value;
  }
  /// The same in memory that lasts to the program's end, as the value then does, uncounted.
  template <class T, class... Arguments>
  static T* makeForever(void* memory, Arguments&&... arguments) {
    T* value = new (memory) T(std::forward<Arguments>(arguments)...);
    value->keeper_ = Keeper::program;
    return value;
  }

  /// Ends the value, whose last reference is gone.
  virtual void destroy() noexcept;
  /// Raises, unless the value is nothing: that understands every message.
  void requireUnderstanding(std::string_view selector) const;

 private:
  /// Who keeps the value: the references to it; its document, on which they count; nobody needs to.
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

  // In a document: how many units the value stands from the start of its block.
  std::atomic<std::uint32_t> count_{1};
  Kind kind_;
  Keeper keeper_ = Keeper::references;
};

/// Whether arrays and dictionaries can change: `ignored` ones swallow every change (they stand for
/// an absent collection), `immutable` ones raise an invalid-argument exception.
enum class Mutability : std::uint8_t { ignored, immutable, changeable };

}  // namespace toolkit
