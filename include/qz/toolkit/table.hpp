// SPDX-License-Identifier: MIT
// Tables, with string keys, and lists of objects that are not script values (controls, timers).
//
// Both are shared: a getter of the engine returns the object that the engine itself changes. On an
// absent table or list, changes do nothing and queries answer zero or absent.
//
// An object that is removed may be destroyed, and its destructor may use the table. Therefore a
// change is complete before any object is released.
#pragma once

#include <cstddef>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "qz/toolkit/ref.hpp"

namespace qz::toolkit {

/// A table of objects with string keys.
template <class T>
class Table {
 public:
  using Entries = std::map<std::string, T, std::less<>>;  ///< sorted by key

  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Table& nothing() {
    static Table table(false);
    return table;
  }
  /// Makes an empty table.
  static Ref<Table> make() { return std::shared_ptr<Table>(new Table(true)); }

  /// Returns the number of entries.
  std::size_t count() const { return entries_.size(); }
  /// The entries, sorted by key.
  const Entries& entries() const { return entries_; }
  /// Returns the entry under `key`, or a default T.
  T objectForKey(std::string_view key) const {
    const auto found = entries_.find(key);
    return found == entries_.end() ? T{} : found->second;
  }
  /// Whether there is an entry under `key`.
  bool contains(std::string_view key) const { return entries_.find(key) != entries_.end(); }

  /// Sets the entry under `key`.
  void setObject(T object, std::string_view key) {
    if (exists_) std::swap(entries_[std::string(key)], object);
  }
  /// Removes the entry under `key`, if there is one.
  void removeObjectForKey(std::string_view key) {
    if (const auto found = entries_.find(key); found != entries_.end()) entries_.extract(found);
  }
  /// Removes all entries.
  void removeAllObjects() { Entries().swap(entries_); }

 private:
  explicit Table(bool exists) : exists_(exists) {}

  Entries entries_;
  bool exists_;  // false only for the object behind absent tables
};

/// A list of objects.
template <class T>
class List {
 public:
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static List& nothing() {
    static List list(false);
    return list;
  }
  /// Makes an empty list.
  static Ref<List> make() { return std::shared_ptr<List>(new List(true)); }

  /// Returns the number of elements.
  std::size_t count() const { return elements_.size(); }
  /// Returns the elements, in the order in which they were added.
  const std::vector<T>& elements() const { return elements_; }

  /// Adds an element at the end.
  void addObject(T object) {
    if (exists_) elements_.push_back(std::move(object));
  }
  /// Removes all elements.
  void removeAllObjects() { std::vector<T>().swap(elements_); }

 private:
  explicit List(bool exists) : exists_(exists) {}

  std::vector<T> elements_;
  bool exists_;  // false only for the object behind absent lists
};

}  // namespace qz::toolkit
