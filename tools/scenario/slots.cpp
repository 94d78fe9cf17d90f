// SPDX-License-Identifier: MIT
// The slots of the statements' forms.

#include "tools/scenario/slots.hpp"

#include <algorithm>
#include <cassert>
#include <cstdint>
#include <iterator>
#include <limits>

#include "qz/drivers/view_kinds.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools::scenario {
namespace {

constexpr std::int64_t mostRepeats = 1'000'000;

bool isWord(const Word& word, SlotContext&) { return word.kind != Word::Kind::json; }

bool isNumber(const Word& word, SlotContext&) {
  return word.kind == Word::Kind::bare && numberIn(word.text).has_value();
}

bool isDuration(const Word& word, SlotContext& context) {
  return isNumber(word, context) && numberIn(word.text)->get<double>() >= 0;
}

std::optional<Json> wholeNumberIn(const Word& word) {
  if (word.kind != Word::Kind::bare) return std::nullopt;
  const auto number = numberIn(word.text);
  return number && number->is_number_integer() ? number : std::nullopt;
}

bool isSigned(const Word& word, SlotContext&) {
  const auto number = wholeNumberIn(word);
  if (!number) return false;
  return !number->is_number_unsigned() ||
         number->get<std::uint64_t>() <= std::uint64_t{std::numeric_limits<std::int64_t>::max()};
}

bool isUnsigned(const Word& word, SlotContext&) {
  const auto number = wholeNumberIn(word);
  return number && number->is_number_unsigned();
}

bool isCount(const Word& word, SlotContext&) {
  const auto number = wholeNumberIn(word);
  return number && number->get<std::int64_t>() >= 1 && number->get<std::int64_t>() <= mostRepeats;
}

bool holdsNull(const Json& value) {
  if (value.is_null()) return true;
  return value.is_structured() && std::any_of(value.begin(), value.end(), holdsNull);
}

bool isPropertyList(const Word& word, SlotContext&) {
  if (!readValue(word, anyJson)) return false;
  if (holdsNull(word.value) && word.kind == Word::Kind::json) {
    throw SyntaxError(word.at, "null is not allowed in a property-list value");
  }
  return true;
}

bool isList(const Word& word, SlotContext& context) {
  return word.value.is_array() && isPropertyList(word, context);
}

bool isObject(const Word& word, SlotContext& context) {
  return word.value.is_object() && isPropertyList(word, context);
}

bool isToolkit(const Word& word, SlotContext&) {
  const auto names = toolkitNames();
  return std::any_of(names.begin(), names.end(), [&](auto name) { return word.isBare(name); });
}

// Nothing may be written outside the resource directory, which is removed with the scenario.
bool isFileName(const Word& word, SlotContext& context) {
  if (!isWord(word, context) || word.text.empty()) return false;
  const auto parts = '/' + word.text + '/';
  if (word.text.front() == '/' || parts.find("/../") != std::string::npos ||
      parts.find("/./") != std::string::npos || parts.find("//") != std::string::npos ||
      word.text.find_first_of("$\\") != std::string::npos ||
      word.text.find('\0') != std::string::npos) {
    throw SyntaxError(word.at,
                      inQuotes(word.text) + " does not name a file in the resource directory");
  }
  return true;
}

bool isRelativePath(const Word& word, SlotContext& context) {
  return isWord(word, context) && !word.text.empty() && word.text.front() != '/' &&
         word.text.find('\0') == std::string::npos;
}

bool isClass(const Word& word, SlotContext& context) {
  if (!isWord(word, context)) return false;
  if (drivers::viewKindNamed(word.text)) return true;
  const auto names = drivers::viewKindNames();
  throw SyntaxError(word.at, "unknown class " + inQuotes(word.text) + didYouMean(word.text, names) +
                                 "; the classes are " + enumerate({names.begin(), names.end()}));
}

bool isConstant(const Word& word, SlotContext& context) {
  if (!isWord(word, context)) return false;
  const auto& known = context.vocabulary.constants;
  const auto matches = [&](std::string_view name) { return name == fullConstantName(word.text); };
  if (std::any_of(known.begin(), known.end(), matches)) return true;
  throw SyntaxError(word.at, "unknown command name " + inQuotes(word.text) +
                                 didYouMean(fullConstantName(word.text), known));
}

bool isNewName(const Word& word, SlotContext& context) {
  if (word.kind != Word::Kind::bare) return false;
  if (const auto reason = context.names.whyNotNew(word)) throw SyntaxError(word.at, *reason);
  return true;
}

NameKind requireDeclared(const Word& word, const SlotContext& context) {
  if (const auto kind = context.names.kindOf(word.text)) return *kind;
  throw SyntaxError(word.at, inQuotes(word.text) + " is not declared" +
                                 didYouMean(word.text, context.names.all()));
}

template <NameKind... kinds>
bool isNameOf(const Word& word, SlotContext& context) {
  if (word.kind != Word::Kind::bare) return false;
  const auto found = requireDeclared(word, context);
  if (((found == kinds) || ...)) return true;
  throw SyntaxError(word.at, inQuotes(word.text) + " is " + std::string(describe(found)) +
                                 ", expected " + enumerate({std::string(describe(kinds))...}));
}

// --- properties ---

struct Subject {
  std::string_view described;
  const std::vector<PropertyInfo>* properties;  // null for a kept value, which has none
};

std::optional<Subject> subjectNamed(const std::string& name, const SlotContext& context) {
  const auto& vocabulary = context.vocabulary;
  if (name == "engine") return Subject{"the engine", &vocabulary.engine};
  const auto kind = context.names.kindOf(name);
  if (!kind) return std::nullopt;
  switch (*kind) {
    case NameKind::window:
      return Subject{"a window", &vocabulary.window};
    case NameKind::control:
      return Subject{"a control", &vocabulary.control};
    case NameKind::kept:
      break;
  }
  return Subject{"a kept value", nullptr};
}

[[noreturn]] void refuseSubject(const Word& word, const Path& path, const SlotContext& context) {
  auto known = context.names.all();
  known.insert(known.end(), {"engine", "tutorial"});
  throw SyntaxError(word.at,
                    inQuotes(path.subject) + " is not declared" + didYouMean(path.subject, known));
}

const PropertyInfo& requireProperty(const Word& word, const Path& path, const Subject& subject) {
  std::vector<std::string_view> names;
  for (const auto& property : *subject.properties) {
    if (property.name == *path.property) return property;
    names.push_back(property.name);
  }
  throw SyntaxError(word.at, std::string(subject.described) + " has no property " +
                                 inQuotes(*path.property) + didYouMean(*path.property, names));
}

bool isReadable(const Word& word, SlotContext& context) {
  if (word.kind != Word::Kind::bare) return false;
  const auto path = splitPath(word.text);
  const auto subject = subjectNamed(path.subject, context);
  if (!subject && !path.property) return false;
  if (!subject) refuseSubject(word, path, context);
  context.value = anyExpectation;
  if (!subject->properties) return true;
  if (!path.property) return false;
  const auto& property = requireProperty(word, path, *subject);
  if (!path.key) {
    context.value = property.read;
  } else if (!includes(property.read, Takes::object)) {
    throw SyntaxError(word.at, inQuotes(path.subject + "." + *path.property) + " has no keys");
  }
  return true;
}

bool isSettable(const Word& word, SlotContext& context) {
  if (word.kind != Word::Kind::bare) return false;
  const auto path = splitPath(word.text);
  if (!path.property || path.key) return false;
  const auto subject = subjectNamed(path.subject, context);
  if (!subject) refuseSubject(word, path, context);
  if (!subject->properties) return false;
  const auto& property = requireProperty(word, path, *subject);
  if (property.written != Takes::nothing) {
    context.value = property.written;
    return true;
  }
  std::vector<std::string> settable;
  for (const auto& other : *subject->properties) {
    if (other.written != Takes::nothing) settable.emplace_back(other.name);
  }
  throw SyntaxError(word.at,
                    inQuotes(word.text) + " cannot be set" +
                        (settable.empty() ? "" : "; these can be set: " + enumerate(settable)));
}

bool isEngineProperty(const Word& word, SlotContext& context) {
  return splitPath(word.text).subject == "engine" && isReadable(word, context);
}

bool isValue(const Word& word, SlotContext& context) {
  if (!readValue(word, context.value)) {
    throw SyntaxError(word.at, "found " + describe(word) + ", expected " + describe(context.value));
  }
  const bool namesWindow =
      includes(context.value, Takes::window) && !word.isBare("absent") && !word.isBare("present");
  return !namesWindow || isNameOf<NameKind::window>(word, context);
}

bool isSetting(const Word& word, SlotContext& context) {
  if (word.kind == Word::Kind::json) isPropertyList(word, context);
  return isValue(word, context);
}

const std::string toolkitChoice = [] {
  const auto names = toolkitNames();
  return enumerate({names.begin(), names.end()});
}();

const Slot slots[] = {
    {"+C", "a name for the control", isNewName},
    {"+NAME", "a name", isNewName},
    {"+W", "a name for the window", isNewName},
    {"C", "a control (a declared name, #TAG or @INDEX)", isNameOf<NameKind::control>},
    {"C2", "a control (a declared name, #TAG or @INDEX)", isNameOf<NameKind::control>},
    {"CLASS", "a class such as NSButton", isClass},
    {"CONSTANT", "the name of a command", isConstant},
    {"COUNT", "a whole number from 1 to 1000000", isCount},
    {"ENGINE.PROPERTY", "engine.PROPERTY", isEngineProperty},
    {"FILE", "the name of a file", isFileName},
    {"HEIGHT", "a number", isNumber},
    {"ID", "a whole number", isSigned},
    {"JSON", "JSON", isPropertyList},
    {"KEPT", "the name of a kept value", isNameOf<NameKind::kept>},
    {"KEY", "a key", isWord},
    {"LIST", "a JSON list", isList},
    {"OBJECT", "a JSON object", isObject},
    {"PATH", "a path relative to the scenario's folder", isRelativePath},
    {"PLACE", "a window or a control", isNameOf<NameKind::window, NameKind::control>},
    {"PROPERTY", "NAME.PROPERTY", isReadable},
    {"SECONDS", "a number of seconds, 0 or more", isDuration},
    {"SETTABLE", "NAME.PROPERTY", isSettable},
    {"SETTING", "a value", isSetting},
    {"TAG", "a whole number", isSigned},
    {"TEXT", "a text", isWord},
    {"TOOLKIT", toolkitChoice, isToolkit},
    {"UNSIGNED", "a whole number, 0 or more", isUnsigned},
    {"VALUE", "a value", isValue},
    {"W", "a window (a declared name or tutorial)", isNameOf<NameKind::window>},
    {"WIDTH", "a number", isNumber},
    {"X", "a number", isNumber},
    {"Y", "a number", isNumber},
};

}  // namespace

const Slot& slotNamed(std::string_view name) {
  const auto* const found = std::find_if(std::begin(slots), std::end(slots),
                                         [&](const Slot& slot) { return slot.name == name; });
  assert(found != std::end(slots));
  return *found;
}

std::optional<NameKind> declaredBy(std::string_view slot) {
  if (slot == "+W") return NameKind::window;
  if (slot == "+C") return NameKind::control;
  if (slot == "+NAME") return NameKind::kept;
  return std::nullopt;
}

}  // namespace qz::tools::scenario
