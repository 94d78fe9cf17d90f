// SPDX-License-Identifier: MIT
// The values that hold other values: arrays, sets, dictionaries.
//
// Ending a collection takes no more stack however deeply collections nest in it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <memory_resource>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "toolkit/property_list/key_index.hpp"
#include "toolkit/property_list/value.hpp"

namespace toolkit {

/// What arrays, sets and dictionaries have in common.
class Collection : public Value {
 protected:
  Collection(Kind kind, Mutability mutability) : Value(kind), mutability_(mutability) {}
  /// Raises where the collection is immutable; says whether a change is to be made at all.
  bool canChange(std::string_view selector) const {
    return mutability_ == Mutability::changeable || refuseChange(selector);
  }
  /// Raises when `value` is absent.
  void requirePresent(const ValueRef<>& value, std::string_view selector) const;

 private:
  void destroy() noexcept final;
  /// Raises, unless changes are ignored.
  bool refuseChange(std::string_view selector) const;

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
  std::size_t count() const override { return elements_.size(); }
  const ValueRef<>& objectAtIndex(std::size_t index) const override {
    return index < elements_.size() ? elements_[index] : objectBeyondEnd(index);
  }

  /// Changes raise where `Mutability` says so; adding an absent value raises.
  void addObject(const ValueRef<>& value);
  void removeAllObjects();
  /// Has the elements given instead of its own (`setArray:`).
  void setElements(std::span<const ValueRef<>> elements);
  /// The same without a count of them, nor a copy: the caller sees to it that they stay where they
  /// are until the array has others, or ends. It takes hardly longer than a call would.
  void borrowElements(std::span<const ValueRef<>> elements) {
    if (!canChange("setArray:")) return;
    own_->clear();
    elements_ = elements;
  }

  /// As an immutable part of `document`, like its elements; the caller gets no count.
  static Array* make(Document& document, std::span<Value* const> elements);

 private:
  friend class Value;
  explicit Array(Kind kind) : Collection(kind, Mutability::ignored) {}
  Array(std::vector<ValueRef<>>&& elements, Mutability mutability);
  Array(std::span<Value* const> elements, Document* document);
  const ValueRef<>& objectBeyondEnd(std::size_t index) const;

  std::span<const ValueRef<>> elements_;  // `own_`, or a document's, or borrowed
  std::unique_ptr<std::vector<ValueRef<>>> own_;
};

/// Values without an order, from binary property lists; they keep the order of the file.
class Set final : public Collection {
 public:
  static Set& nothing();
  static ValueRef<Set> make(std::vector<ValueRef<>> elements);
  /// As a part of `document`, like its elements; the caller gets no count.
  static Set* make(Document& document, std::span<Value* const> elements);
  /// The elements in the order of the file. Valid as long as the set is.
  std::span<const ValueRef<>> elements() const { return elements_; }
  std::size_t count() const override;

 private:
  friend class Value;
  explicit Set(Kind kind) : Collection(kind, Mutability::ignored) {}
  explicit Set(std::vector<ValueRef<>>&& elements);
  Set(std::span<Value* const> elements, Document* document);

  std::span<const ValueRef<>> elements_;  // `own_`, or a document's
  std::vector<ValueRef<>> own_;
};

/// Values under keys. The keys that scripts and tables use are strings; a binary property list may
/// hold others, which no look-up by string finds. Keys keep the order in which they first came.
class Dictionary final : public Collection {
 public:
  struct Entry {
    ValueRef<> key;
    ValueRef<> value;
  };

  /// Which value a key has that comes more than once.
  enum class Duplicates : std::uint8_t { firstWins, lastWins };

  static Dictionary& nothing();
  /// Of a key that comes more than once the last value counts.
  static ValueRef<Dictionary> make(std::vector<Entry> entries = {},
                                   Mutability mutability = Mutability::changeable);
  /// Up to here looking at every key is faster than hashing the one that is looked up.
  static constexpr std::size_t mostWithoutIndex = 8;
  /// As an immutable part of `document`, like its keys and values, which alternate in
  /// `keysAndValues`; the caller gets no count. `laterHashes` are those of the keys after the first
  /// `mostWithoutIndex` of them, taken while each was at hand: later a large file's keys are cold.
  static Dictionary* make(Document& document, std::span<Value* const> keysAndValues,
                          std::span<const std::uint64_t> laterHashes, Duplicates duplicates);

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
  // Only where there are many entries. In a document it lies in the document's memory: it is safe
  // in this pointer because no destructor runs there.
  std::unique_ptr<KeyIndex> index_;
};

/// `value` as the kind named, or absent when it is absent or of another kind.
ValueRef<Array> asArray(const ValueRef<>& value);
ValueRef<Dictionary> asDictionary(const ValueRef<>& value);

}  // namespace toolkit
