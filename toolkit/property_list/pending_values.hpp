// SPDX-License-Identifier: MIT
// The content so far of the collections that a reader has not finished reading.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "qz/property_list/collections.hpp"
#include "qz/property_list/document.hpp"
#include "qz/property_list/key_index.hpp"

namespace qz::toolkit {

/// A stack: values are added to the collection that was opened last, which is also closed first.
class PendingValues {
 public:
  explicit PendingValues(Document& document) : document_(document) {}

  /// An open collection: the sizes of the stacks when it was opened.
  struct Collecting {
    std::size_t firstValue;
    std::size_t firstHash;
  };
  Collecting open() const { return {values_.size(), hashes_.size()}; }

  void add(Value* value) { values_.push_back(value); }
  /// Adds the key of the value that is added next.
  void addKey(Value* key, const Collecting& dictionary) {
    if ((values_.size() - dictionary.firstValue) / 2 >= Dictionary::mostWithoutIndex) {
      hashes_.push_back(hashOfKey(*key));
    }
    values_.push_back(key);
  }
  /// Returns the content of a collection so far; in a dictionary, keys and values alternate.
  std::span<Value* const> in(const Collecting& collection) const {
    return std::span(values_).subspan(collection.firstValue);
  }

  Array* closeArray(const Collecting& array) {
    return closed(array, Array::make(document_, in(array)));
  }
  Set* closeSet(const Collecting& set) { return closed(set, Set::make(document_, in(set))); }
  Dictionary* closeDictionary(const Collecting& dictionary, Dictionary::Duplicates duplicates) {
    const auto hashes = std::span(hashes_).subspan(dictionary.firstHash);
    return closed(dictionary, Dictionary::make(document_, in(dictionary), hashes, duplicates));
  }

 private:
  template <class T>
  T* closed(const Collecting& collection, T* made) {
    values_.resize(collection.firstValue);
    hashes_.resize(collection.firstHash);
    return made;
  }

  Document& document_;
  std::vector<Value*> values_;         // of the open collections, the outermost first
  std::vector<std::uint64_t> hashes_;  // of their keys, except the first few of each dictionary
};

}  // namespace qz::toolkit
