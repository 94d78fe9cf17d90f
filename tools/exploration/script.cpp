// SPDX-License-Identifier: MIT
#include "tools/exploration/script.hpp"

#include <algorithm>

#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::check {
namespace {

Element elementOf(const ValueRef<>& value) {
  Element element{.value = value};
  if (const auto simple = toolkit::asString(value)) {
    element.command = simpleCommandNamed(simple->text());
    return element;
  }
  const auto array = toolkit::asArray(value);
  element.isCompound = static_cast<bool>(array);
  if (array->count() == 0) return element;
  if (const auto name = toolkit::asString(array->objectAtIndex(0))) {
    element.command = compoundCommandNamed(name->text());
  }
  return element;
}

/// Returns the tag whose decimal form is exactly `key`.
std::optional<Tag> tagOf(const ValueRef<>& key) {
  if (!toolkit::asString(key)) return std::nullopt;
  const std::string text = key->description();
  const auto tag = walkthrough::parseNumber<Tag>(text);
  return tag && std::to_string(*tag) == text ? tag : std::nullopt;
}

bool isNumeric(const ValueRef<>& value) {
  return toolkit::asString(value) || toolkit::asNumber(value);
}

/// Whether the engine acts on the list's own control, whatever the parameters say.
bool ignoresTagParameter(const Element& element) {
  return element.command->extraParameters == ExtraParameters::overrideTheTag &&
         element.parameterCount() > element.command->parameters.size();
}

}  // namespace

std::size_t Element::parameterCount() const {
  return isCompound && value->count() > 0 ? value->count() - 1 : 0;
}

ValueRef<> Element::parameter(std::size_t position) const {
  return position < parameterCount() ? value->objectAtIndex(position + 1) : nullptr;
}

std::optional<Tag> Element::target(Tag ownId) const {
  if (!command) return std::nullopt;
  auto position = command->positionOf(ParameterType::controlTag);
  if (!position) position = command->positionOf(ParameterType::controlOrListTag);
  if (!isCompound) return command->target == TargetKind::none ? std::nullopt : std::optional(ownId);
  if (!position) return std::nullopt;
  const auto given = parameter(*position);
  const bool isOptional = command->parameters[*position].isOptional;
  if (isOptional && (!given || ignoresTagParameter(*this))) return ownId;
  return given && isNumeric(given) ? std::optional<Tag>(given->intValue()) : std::nullopt;
}

Script::Script(ValueRef<toolkit::Dictionary> dictionary) : dictionary_(std::move(dictionary)) {
  for (const auto& [key, value] : dictionary_->entries()) {
    ScriptList list{.key = key->description(),
                    .keyValue = key,
                    .tag = tagOf(key),
                    .value = value,
                    .firstElement = elementCount_};
    for (const auto& element : toolkit::asArray(value)->elements()) {
      list.elements.push_back(elementOf(element));
    }
    elementCount_ += list.elements.size();
    if (list.tag) byTag_.emplace(*list.tag, lists_.size());
    if (toolkit::asString(key)) byKey_.emplace(list.key, lists_.size());
    lists_.push_back(std::move(list));
  }
}

const Element& Script::element(std::size_t number) const {
  const auto [list, element] = placeOf(number);
  return lists_[list].elements[element];
}

std::pair<std::size_t, std::size_t> Script::placeOf(std::size_t element) const {
  const auto after = std::upper_bound(
      lists_.begin(), lists_.end(), element,
      [](std::size_t wanted, const ScriptList& each) { return wanted < each.firstElement; });
  const auto list = static_cast<std::size_t>(after - lists_.begin()) - 1;
  return {list, element - lists_[list].firstElement};
}

std::optional<std::size_t> Script::listOfTag(Tag tag) const {
  const auto found = byTag_.find(tag);
  return found == byTag_.end() ? std::nullopt : std::optional(found->second);
}

std::optional<std::size_t> Script::listUnder(std::string_view key) const {
  const auto found = byKey_.find(std::string(key));
  return found == byKey_.end() ? std::nullopt : std::optional(found->second);
}

// Two keys may share one array in a binary file, so that the id decides first.
std::optional<std::size_t> Script::runningList(const ValueRef<>& value, Tag id) const {
  const auto own = listOfTag(id);
  if (own && lists_[*own].value == value) return own;
  for (std::size_t i = 0; i < lists_.size(); ++i) {
    if (lists_[i].value == value) return i;
  }
  return std::nullopt;
}

std::vector<Tag> Script::newTags() const {
  std::vector<Tag> tags;
  for (const ScriptList& list : lists_) {
    for (const Element& element : list.elements) {
      if (!element.command) continue;
      const auto position = element.command->positionOf(ParameterType::newTag);
      const auto given = position ? element.parameter(*position) : nullptr;
      if (given && isNumeric(given)) tags.push_back(given->intValue());
    }
  }
  return tags;
}

}  // namespace qz::tools::check
