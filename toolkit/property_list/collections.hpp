// The values that hold other values: arrays, sets, dictionaries.
//
// Ending a collection takes no more stack however deeply collections nest in it.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// What arrays, sets and dictionaries have in common.
class Collection : public Value {
 protected:
  Collection(Kind kind, Mutability mutability) : Value(kind), mutability_(mutability) {}
  /// Raises where the collection is immutable; says whether a change is to be made at all.
  bool canChange(std::string_view selector) const;
  /// Raises when `value` is absent.
  void requirePresent(const ValueRef<>& value, std::string_view selector) const;

 private:
  void destroy() noexcept final;

  Mutability mutability_;
  Collection* nextToDestroy_ = nullptr;
};

class Array final : public Collection {
 public:
  static Array& nothing();
  static ValueRef<Array> make(std::vector<ValueRef<>> elements = {},
                              Mutability mutability = Mutability::changeable);

  /// The elements in order. Valid until the array changes.
  std::span<const ValueRef<>> elements() const { return elements_; }
  std::size_t count() const override;
  ValueRef<> objectAtIndex(std::size_t index) const override;

  /// Changes raise where `Mutability` says so; adding an absent value raises.
  void addObject(const ValueRef<>& value);
  void removeAllObjects();

 private:
  friend class Value;
  explicit Array(Kind kind) : Collection(kind, Mutability::ignored) {}
  Array(std::vector<ValueRef<>> elements, Mutability mutability);

  std::vector<ValueRef<>> elements_;
};

/// Values without an order, from binary property lists; they keep the order of the file.
class Set final : public Collection {
 public:
  static Set& nothing();
  static ValueRef<Set> make(std::vector<ValueRef<>> elements);
  /// The elements in the order of the file. Valid as long as the set is.
  std::span<const ValueRef<>> elements() const { return elements_; }
  std::size_t count() const override;

 private:
  friend class Value;
  explicit Set(Kind kind) : Collection(kind, Mutability::ignored) {}
  explicit Set(std::vector<ValueRef<>> elements);

  std::vector<ValueRef<>> elements_;
};

/// Values under keys. The keys that scripts and tables use are strings; a binary property list may
/// hold others, which no look-up by string finds. Keys keep the order in which they first came.
class Dictionary final : public Collection {
 public:
  struct Entry {
    ValueRef<> key;
    ValueRef<> value;
  };

  static Dictionary& nothing();
  static ValueRef<Dictionary> make(std::vector<Entry> entries = {},
                                   Mutability mutability = Mutability::changeable);

  /// The entries in order. Valid until the dictionary changes.
  std::span<const Entry> entries() const { return entries_; }
  std::size_t count() const override;
  /// The value under a string key, or absent.
  ValueRef<> objectForKey(std::string_view key) const;
  /// The string keys in order, copied: a walk over them survives changes.
  std::vector<std::string> allKeys() const;
  /// A new dictionary with the same keys and values (the values are shared).
  ValueRef<Dictionary> copy(Mutability mutability) const;

  /// Changes raise where `Mutability` says so; an absent value raises. An entry that is there keeps
  /// its place when its value is replaced.
  void setObject(const ValueRef<>& value, std::string_view key);
  void removeObjectForKey(std::string_view key);
  void removeAllObjects();

 private:
  friend class Value;
  explicit Dictionary(Kind kind) : Collection(kind, Mutability::ignored) {}
  Dictionary(std::vector<Entry> entries, Mutability mutability);
  std::size_t position(std::string_view key) const;

  std::vector<Entry> entries_;
};

/// `value` as the kind named, or absent when it is absent or of another kind.
ValueRef<Array> asArray(const ValueRef<>& value);
ValueRef<Dictionary> asDictionary(const ValueRef<>& value);

}  // namespace toolkit
