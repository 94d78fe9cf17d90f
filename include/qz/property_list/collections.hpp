// SPDX-License-Identifier: MIT
// Values that hold other values: arrays, sets, dictionaries.
//
// The destruction of a collection uses a fixed amount of stack, however deeply collections nest in
// it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <memory_resource>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/property_list/key_index.hpp"
#include "qz/property_list/value.hpp"

namespace qz::toolkit {

/// The base of arrays, sets and dictionaries.
class QZ_API Collection : public Value {
 protected:
  /// Makes an empty collection of the kind.
  Collection(Kind kind, Mutability mutability) : Value(kind), mutability_(mutability) {}
  /// Raises if the collection is immutable. False if changes are ignored.
  bool canChange(std::string_view selector) const {
    return mutability_ == Mutability::changeable || refuseChange(selector);
  }
  /// Raises if `value` is absent.
  void requirePresent(const ValueRef<>& value, std::string_view selector) const;

 private:
  void destroy() noexcept final;
  /// Raises, unless changes are ignored.
  bool refuseChange(std::string_view selector) const;

  Mutability mutability_;
  Collection* nextToDestroy_ = nullptr;
};

/// An ordered list of values.
class QZ_API Array final : public Collection {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Array& nothing();
  /// Makes an array of the elements.
  static ValueRef<Array> make(std::vector<ValueRef<>> elements = {},
                              Mutability mutability = Mutability::changeable);

  /// Returns the elements in order; valid until the array changes.
  std::span<const ValueRef<>> elements() const { return elements_; }
  std::size_t count() const override { return elements_.size(); }
  const ValueRef<>& objectAtIndex(std::size_t index) const override {
    return index < elements_.size() ? elements_[index] : objectBeyondEnd(index);
  }

  /// Changes raise if the array is immutable; adding an absent value raises.
  void addObject(const ValueRef<>& value);
  /// Removes all elements. Raises if the array is immutable.
  void removeAllObjects();
  /// Replaces the elements (`setArray:`).
  void setElements(std::span<const ValueRef<>> elements);
  /// The same without counting or copying: the caller keeps the elements in place until the array
  /// gets others or is destroyed. Costs hardly more than a function call.
  void borrowElements(std::span<const ValueRef<>> elements) {
    if (!canChange("setArray:")) return;
    own_->clear();
    elements_ = elements;
  }

  /// Makes an immutable array in `document`, as its elements must be; the caller gets no count.
  static Array* make(Document& document, std::span<Value* const> elements);

 private:
  friend class Value;
  explicit Array(Kind kind) : Collection(kind, Mutability::ignored) {}
  Array(std::vector<ValueRef<>>&& elements, Mutability mutability);
  Array(std::span<Value* const> elements, Document* document);
  const ValueRef<>& objectBeyondEnd(std::size_t index) const;

  std::span<const ValueRef<>> elements_;  // those of `own_`, in a document, or borrowed
  std::unique_ptr<std::vector<ValueRef<>>> own_;
};

/// An unordered set of values, from a binary property list; it keeps the order of the file.
class QZ_API Set final : public Collection {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Set& nothing();
  /// Makes a set of the elements, without duplicates.
  static ValueRef<Set> make(std::vector<ValueRef<>> elements);
  /// Makes a set in `document`, as its elements must be; the caller gets no count.
  static Set* make(Document& document, std::span<Value* const> elements);
  /// Returns the elements in the order of the file; valid as long as the set.
  std::span<const ValueRef<>> elements() const { return elements_; }
  std::size_t count() const override;

 private:
  friend class Value;
  explicit Set(Kind kind) : Collection(kind, Mutability::ignored) {}
  explicit Set(std::vector<ValueRef<>>&& elements);
  Set(std::span<Value* const> elements, Document* document);

  std::span<const ValueRef<>> elements_;  // those of `own_`, or in a document
  std::vector<ValueRef<>> own_;
};

/// Values under keys. Scripts and tables use string keys; a binary property list may hold other
/// keys, which no look-up by string finds. Entries keep the order in which their keys were first
/// added.
class QZ_API Dictionary final : public Collection {
 public:
  /// A key with its value.
  struct Entry {
    ValueRef<> key;    ///< never absent
    ValueRef<> value;  ///< never absent
  };

  /// Which value counts if a key occurs more than once.
  enum class Duplicates : std::uint8_t { firstWins, lastWins };

  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Dictionary& nothing();
  /// If a key occurs more than once, the last value counts.
  static ValueRef<Dictionary> make(std::vector<Entry> entries = {},
                                   Mutability mutability = Mutability::changeable);
  /// Up to this count, comparing every key is faster than hashing the wanted one.
  static constexpr std::size_t mostWithoutIndex = 8;
  /// Makes an immutable dictionary in `document`, as its keys and values must be; these alternate
  /// in `keysAndValues`. The caller gets no count. `laterHashes` are the hashes of the keys after
  /// the first `mostWithoutIndex`, computed when each key was read: later the keys of a large file
  /// are no longer in the cache.
  static Dictionary* make(Document& document, std::span<Value* const> keysAndValues,
                          std::span<const std::uint64_t> laterHashes, Duplicates duplicates);

  /// Returns the entries in order; valid until the dictionary changes.
  std::span<const Entry> entries() const { return entries_; }
  std::size_t count() const override;
  /// Returns the value under a string key, or absent.
  ValueRef<> objectForKey(std::string_view key) const;
  /// Returns a copy of the string keys in order, so that the dictionary may change during a loop
  /// over them.
  std::vector<std::string> allKeys() const;
  /// Returns a new dictionary with the same keys and values (the values are shared).
  ValueRef<Dictionary> copy(Mutability mutability) const;

  /// Changes raise if the dictionary is immutable; an absent value raises. An existing entry keeps
  /// its place when its value is replaced.
  void setObject(const ValueRef<>& value, std::string_view key);
  /// Removes the entry under `key`, if there is one. Raises if the dictionary is immutable.
  void removeObjectForKey(std::string_view key);
  /// Removes all entries. Raises if the dictionary is immutable.
  void removeAllObjects();

 private:
  friend class Value;
  explicit Dictionary(Kind kind) : Collection(kind, Mutability::ignored) {}
  Dictionary(std::span<Entry> entries, Mutability mutability);
  Dictionary(std::span<Value* const> keysAndValues, std::span<const std::uint64_t> laterHashes,
             Duplicates duplicates, Document* document);
  Dictionary(const Dictionary& other, Mutability mutability);

  template <class IsKey>
  std::size_t positionWhere(std::uint64_t hash, IsKey isKey) const;
  std::size_t positionOf(const Value& key, std::uint64_t hash) const;
  std::size_t positionOf(std::string_view key, std::uint64_t hash) const;
  std::uint64_t hashFor(std::string_view key) const { return index_ ? hashOf(key) : 0; }
  void append(Entry&& entry, std::uint64_t hash);
  void growIndex();

  std::pmr::vector<Entry> entries_{std::pmr::new_delete_resource()};
  // Null if there are few entries. In a document, the index lies in the document's memory; the
  // pointer never deletes it, because no destructor runs there.
  std::unique_ptr<KeyIndex> index_;
};

/// Returns `value` as an array; absent if it is absent or of another kind.
QZ_API ValueRef<Array> asArray(const ValueRef<>& value);
/// Returns `value` as a dictionary; absent if it is absent or of another kind.
QZ_API ValueRef<Dictionary> asDictionary(const ValueRef<>& value);

}  // namespace qz::toolkit
