// The values that hold other values: arrays, sets, dictionaries.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/property_list/value.hpp"

namespace toolkit {

class Array final : public Value {
 public:
  static Array& nothing();
  static ValueRef<Array> make(std::vector<ValueRef<>> elements = {},
                              Mutability mutability = Mutability::changeable);

  /// The elements in order. Valid until the array changes.
  const std::vector<ValueRef<>>& elements() const;
  std::size_t count() const override;
  ValueRef<> objectAtIndex(std::size_t index) const override;

  /// Changes raise where `Mutability` says so; adding an absent value raises.
  void addObject(const ValueRef<>& value);
  void removeAllObjects();
};

/// Values without an order, from binary property lists; they keep the order of the file.
class Set final : public Value {
 public:
  static ValueRef<Set> make(std::vector<ValueRef<>> elements);
  const std::vector<ValueRef<>>& elements() const;
  std::size_t count() const override;
};

/// Values under keys. The keys that scripts and tables use are strings; a binary property list may
/// hold others, which no look-up by string finds. Keys keep the order in which they first came.
class Dictionary final : public Value {
 public:
  struct Entry {
    ValueRef<> key;
    ValueRef<> value;
  };

  static Dictionary& nothing();
  static ValueRef<Dictionary> make(std::vector<Entry> entries = {},
                                   Mutability mutability = Mutability::changeable);

  /// The entries in order. Valid until the dictionary changes.
  const std::vector<Entry>& entries() const;
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
};

/// `value` as the kind named, or absent when it is absent or of another kind.
ValueRef<Array> asArray(const ValueRef<>& value);
ValueRef<Dictionary> asDictionary(const ValueRef<>& value);

}  // namespace toolkit
