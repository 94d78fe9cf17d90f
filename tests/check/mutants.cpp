// SPDX-License-Identifier: MIT
// Makes one mistake in a script at a time.
#include "tests/check/mutants.hpp"

#include <algorithm>
#include <set>
#include <utility>

#include "tests/check/draft.hpp"

namespace qz::naive {

namespace {

using toolkit::Array;
using toolkit::Tag;

constexpr Tag unusedTag = 4711;

struct MutableList {
  std::string key;
  std::vector<Value> elements;
};
using MutableLists = std::vector<MutableList>;

bool isTag(ParameterType type) {
  return type == ParameterType::controlTag || type == ParameterType::listTag ||
         type == ParameterType::controlOrListTag || type == ParameterType::newTag;
}

/// Returns the indices in a compound command of the parameters that are tags.
std::vector<std::size_t> tagIndices(const Value& element) {
  std::vector<std::size_t> indices;
  const Command* const command = commandOf(element);
  const auto compound = toolkit::asArray(element);
  if (!command || !compound) return indices;
  for (std::size_t i = 0; i < command->parameters.size() && i + 1 < compound->count(); ++i) {
    if (isTag(command->parameters[i].type)) indices.push_back(i + 1);
  }
  return indices;
}

bool startsTimer(const Value& element) {
  const Command* const command = commandOf(element);
  return command && command->positionOf(ParameterType::seconds).has_value();
}

/// Returns the element with another value at an index; a simple command is its name.
Value replaced(const Value& element, std::size_t index, const Value& value) {
  const auto compound = toolkit::asArray(element);
  if (!compound) return value;
  std::vector<Value> values(compound->elements().begin(), compound->elements().end());
  values[index] = value;
  return Array::make(std::move(values), toolkit::Mutability::immutable);
}

Script scriptOf(const MutableLists& lists) {
  std::vector<toolkit::Dictionary::Entry> entries;
  for (const MutableList& list : lists) {
    entries.push_back({text(list.key), Array::make(list.elements, toolkit::Mutability::immutable)});
  }
  return toolkit::Dictionary::make(std::move(entries), toolkit::Mutability::immutable);
}

class Mutator {
 public:
  Mutator(const Script& script, std::uint64_t seed) : dice_(seed) {
    for (const auto& [key, value] : script->entries()) {
      const auto elements = toolkit::asArray(value)->elements();
      lists_.push_back({key->description(), {elements.begin(), elements.end()}});
    }
    findTags();
  }

  std::vector<Mutant> mutants() {
    for (std::size_t list = 0; list < lists_.size(); ++list) {
      for (std::size_t i = 0; i < lists_[list].elements.size(); ++i) {
        drop(list, i);
        changeTag(list, i);
        misspell(list, i);
        moveTimer(list, i);
      }
      swapWithNext(list);
    }
    return std::move(mutants_);
  }

 private:
  void findTags() {
    std::set<Tag> tags = {unusedTag};
    for (const MutableList& list : lists_) {
      tags.insert(text(list.key)->intValue());
      for (const Value& element : list.elements) {
        for (const std::size_t index : tagIndices(element)) {
          tags.insert(toolkit::asArray(element)->objectAtIndex(index)->intValue());
        }
      }
    }
    tags_.assign(tags.begin(), tags.end());
  }

  void add(Mutant::Mistake mistake, std::size_t list, const std::string& words,
           const MutableLists& lists) {
    mutants_.push_back({mistake, "list " + lists_[list].key + ": " + words, scriptOf(lists)});
  }
  std::string nameOf(std::size_t list, std::size_t i) const {
    return "element " + std::to_string(i) + ", " + lists_[list].elements[i]->description();
  }

  void drop(std::size_t list, std::size_t i) {
    MutableLists lists = lists_;
    auto& elements = lists[list].elements;
    elements.erase(elements.begin() + static_cast<std::ptrdiff_t>(i));
    add(Mutant::Mistake::dropped, list, nameOf(list, i) + ", is dropped", lists);
  }

  void changeTag(std::size_t list, std::size_t i) {
    const auto indices = tagIndices(lists_[list].elements[i]);
    if (indices.empty()) return;
    const std::size_t index = dice_.oneOf(indices);
    MutableLists lists = lists_;
    Value& element = lists[list].elements[i];
    const Tag old = toolkit::asArray(element)->objectAtIndex(index)->intValue();
    Tag other = old;
    while (other == old) other = dice_.oneOf(tags_);
    element = replaced(element, index, number(other));
    add(Mutant::Mistake::otherTag, list,
        nameOf(list, i) + ", names " + std::to_string(other) + " instead of " + std::to_string(old),
        lists);
  }

  void misspell(std::size_t list, std::size_t i) {
    MutableLists lists = lists_;
    Value& element = lists[list].elements[i];
    const auto compound = toolkit::asArray(element);
    std::string name = (compound ? compound->objectAtIndex(0) : element)->description();
    name.erase(dice_.below(name.size()), 1);
    element = replaced(element, 0, text(name));
    add(Mutant::Mistake::misspelt, list, nameOf(list, i) + ", is misspelt " + name, lists);
  }

  void moveTimer(std::size_t list, std::size_t i) {
    if (lists_.size() < 2 || !startsTimer(lists_[list].elements[i])) return;
    const std::size_t to = (list + 1 + dice_.below(lists_.size() - 1)) % lists_.size();
    MutableLists lists = lists_;
    auto& elements = lists[list].elements;
    lists[to].elements.push_back(elements[i]);
    elements.erase(elements.begin() + static_cast<std::ptrdiff_t>(i));
    add(Mutant::Mistake::timerMoved, list, nameOf(list, i) + ", moves to list " + lists_[to].key,
        lists);
  }

  void swapWithNext(std::size_t list) {
    if (list + 1 == lists_.size()) return;
    MutableLists lists = lists_;
    std::swap(lists[list].elements, lists[list + 1].elements);
    add(Mutant::Mistake::listsSwapped, list, "is swapped with list " + lists_[list + 1].key, lists);
  }

  Dice dice_;
  MutableLists lists_;
  std::vector<Tag> tags_;
  std::vector<Mutant> mutants_;
};

}  // namespace

std::vector<Mutant> mutantsOf(const Script& script, std::uint64_t seed) {
  return Mutator(script, seed).mutants();
}

}  // namespace qz::naive
