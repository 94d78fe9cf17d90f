// SPDX-License-Identifier: MIT
// A script as the checks see it: its lists in the order of the file, and the command of each
// element.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "qz/commands.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz::tools::check {

using toolkit::Tag;
using toolkit::ValueRef;

/// One element of a list.
struct Element {
  ValueRef<> value;
  /// What the engine runs for it; null for an element that is not a command.
  const Command* command = nullptr;
  bool isCompound = false;

  /// Returns the parameter at a position after the name; absent if the element has none there.
  ValueRef<> parameter(std::size_t position) const;
  std::size_t parameterCount() const;
  /// Returns the tag of the control that the command names, in a list that runs for `ownId`. Absent
  /// if the command names none, or if the parameter is not one that the engine can read.
  std::optional<Tag> target(Tag ownId) const;
};

struct ScriptList {
  std::string key;         ///< as text, also if the script has a key of another kind
  ValueRef<> keyValue;     ///< the key in the file
  std::optional<Tag> tag;  ///< absent for a key that no press and no timer finds
  ValueRef<> value;        ///< what is under the key; not always an array
  std::vector<Element> elements{};
  std::size_t firstElement = 0;  ///< the number of elements in the lists before this one
};

class Script {
 public:
  explicit Script(ValueRef<toolkit::Dictionary> dictionary);

  const ValueRef<toolkit::Dictionary>& dictionary() const { return dictionary_; }
  const std::vector<ScriptList>& lists() const { return lists_; }
  /// Returns the number of elements of all lists.
  std::size_t elementCount() const { return elementCount_; }
  const Element& element(std::size_t number) const;
  /// Returns the index of the list of an element, and the element's index in the list.
  std::pair<std::size_t, std::size_t> placeOf(std::size_t element) const;

  /// Returns the index of the list that a press or a timer finds by a tag; absent if there is none.
  std::optional<std::size_t> listOfTag(Tag tag) const;
  /// Returns the index of the list under exactly this key.
  std::optional<std::size_t> listUnder(std::string_view key) const;
  /// Returns the index of the list that the engine runs as `value` for `id`.
  std::optional<std::size_t> runningList(const ValueRef<>& value, Tag id) const;

  /// Returns every tag that the script gives to a control.
  std::vector<Tag> newTags() const;

 private:
  ValueRef<toolkit::Dictionary> dictionary_;
  std::vector<ScriptList> lists_;
  std::size_t elementCount_ = 0;
  std::unordered_map<Tag, std::size_t> byTag_;
  std::unordered_map<std::string, std::size_t> byKey_;
};

}  // namespace qz::tools::check
