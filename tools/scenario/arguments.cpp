// SPDX-License-Identifier: MIT
// The words of one statement, by the slots of its form.

#include "tools/scenario/arguments.hpp"

#include <algorithm>
#include <cassert>

namespace qz::tools::scenario {
namespace {

using Change = std::function<std::string(std::string)>;

Json changedJson(const Json& value, const Change& change) {
  if (value.is_string()) return change(value.get<std::string>());
  auto changed = value;
  if (value.is_array()) {
    for (auto& element : changed) element = changedJson(element, change);
  } else if (value.is_object()) {
    changed = Json::object();
    for (const auto& [key, element] : value.items()) {
      changed[change(key)] = changedJson(element, change);
    }
  }
  return changed;
}

Word changedWord(Word word, const Change& change) {
  if (word.kind == Word::Kind::json) {
    word.value = changedJson(word.value, change);
  } else {
    word.text = change(word.text);
  }
  return word;
}

}  // namespace

bool Arguments::has(std::string_view slot) const {
  return std::any_of(words_.begin(), words_.end(),
                     [&](const auto& word) { return word.first == slot; });
}

const Word& Arguments::word(std::string_view slot) const {
  const auto found = std::find_if(words_.begin(), words_.end(),
                                  [&](const auto& word) { return word.first == slot; });
  assert(found != words_.end());
  return found->second;
}

std::vector<std::string> Arguments::texts(std::string_view slot) const {
  std::vector<std::string> texts;
  for (const auto& [name, word] : words_) {
    if (name == slot) texts.push_back(word.text);
  }
  return texts;
}

double Arguments::number(std::string_view slot) const {
  return numberIn(text(slot)).value().get<double>();
}

std::int64_t Arguments::whole(std::string_view slot) const {
  return numberIn(text(slot)).value().get<std::int64_t>();
}

std::uint64_t Arguments::unsignedWhole(std::string_view slot) const {
  return numberIn(text(slot)).value().get<std::uint64_t>();
}

Arguments Arguments::changed(const Change& change) const {
  Arguments changed;
  changed.nested_ = nested_;
  for (const auto& [slot, word] : words_) changed.add(slot, changedWord(word, change));
  return changed;
}

}  // namespace qz::tools::scenario
