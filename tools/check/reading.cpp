// SPDX-License-Identifier: MIT
// Reads the keys and the elements of a script; parameter_reading.cpp reads the parameters.
#include "tools/check/reading.hpp"

#include <algorithm>

#include "text/uppercase.hpp"
#include "tools/check/parameter_reading.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

class Reader {
 public:
  Reader(const Script& script, toolkit::Toolkit& toolkit) : script_(script), toolkit_(toolkit) {}

  std::vector<Finding> findings() {
    for (const ScriptList& list : script_.lists()) {
      readKey(list);
      for (std::size_t i = 0; i < list.elements.size(); ++i) readElement(list, i);
    }
    return std::move(findings_);
  }

 private:
  void readKey(const ScriptList& list) {
    if (!list.tag) {
      add(findingOf("odd-key",
                    "the key " + quote(list.key) +
                        " is not the plain decimal form of a tag, so no press and no timer finds "
                        "its list",
                    "write the key as a whole number without blanks, plus sign or leading zeros"),
          list, list.keyValue);
    }
    if (!toolkit::asArray(list.value)) {
      add(findingOf("not-a-list",
                    "the value under " + quote(list.key) + " is " + foundWords(list.value) +
                        " and not a list of commands, so running it fails",
                    "write an array of commands"),
          list, list.value);
    }
  }

  void readElement(const ScriptList& list, std::size_t index) {
    const Element& element = list.elements[index];
    std::vector<Finding> found;
    if (auto malformed = whyMalformed(element)) {
      found.push_back(*std::move(malformed));
    } else if (!element.command) {
      found.push_back(unknownCommand(element));
    } else if (element.isCompound) {
      found = readParameters(element, toolkit_);
    }
    for (Finding& finding : found) {
      finding.element = index;
      const auto where = finding.where ? finding.where : element.value;
      add(std::move(finding), list, where);
    }
  }

  static std::optional<Finding> whyMalformed(const Element& element) {
    std::string what;
    if (!element.isCompound) {
      if (toolkit::asString(element.value)) return std::nullopt;
      what = foundWords(element.value);
    } else if (element.value->count() == 0) {
      what = "an empty array";
    } else if (!toolkit::asString(element.value->objectAtIndex(0))) {
      what = "an array that begins with " + foundWords(element.value->objectAtIndex(0));
    } else {
      return std::nullopt;
    }
    return findingOf("malformed-command",
                     "this element is " + what + " and not a command, so the engine skips it",
                     "write a string (the command's name), or an array that begins with the name");
  }

  static Finding unknownCommand(const Element& element) {
    const auto value =
        element.isCompound ? element.value->objectAtIndex(0) : ValueRef<>(element.value);
    const std::string name = value->description();
    std::string message = "no command is called " + quote(name);
    std::string help;
    if (const auto reason = wrongForm(name, element.isCompound)) {
      message = reason->first;
      help = reason->second;
    } else if (const auto meant = nearestName(name, element.isCompound)) {
      help = "did you mean " + *meant + "?";
    }
    return findingOf("unknown-command", message + "; the engine does nothing here", help);
  }

  /// Explains a name that exists, but not as it is written here: the message and the cure.
  static std::optional<std::pair<std::string, std::string>> wrongForm(const std::string& name,
                                                                      bool isCompound) {
    std::string raised;
    const std::string upper(text::uppercased(name, raised));
    for (const Command& command : commandCatalogue()) {
      if (command.name != upper) continue;
      if (command.form == CommandForm::none) {
        return {{name + " is a name without a command", "delete the element"}};
      }
      if (isCompound) {
        return {{name + " is a simple command, and here it is an array",
                 "write the string " + upper + " without an array"}};
      }
      if (command.form == CommandForm::compound) {
        return {{name + " is a compound command, and here it is a string",
                 "write an array: the name, then its parameters"}};
      }
      return {{"the name of a simple command must be written in capitals, and " + quote(name) +
                   " is not",
               "write " + upper}};
    }
    return std::nullopt;
  }

  static std::optional<std::string> nearestName(const std::string& name, bool isCompound) {
    std::vector<std::string_view> candidates;
    const auto other = isCompound ? CommandForm::simple : CommandForm::compound;
    for (const Command& command : commandCatalogue()) {
      if (command.form != CommandForm::none && command.form != other) {
        candidates.emplace_back(command.name);
      }
    }
    std::string raised;
    const std::string_view upper = text::uppercased(name, raised);
    const auto meant = nearest(upper, candidates);
    return meant ? meant : longestWithin(upper, candidates);
  }

  /// Returns the longest candidate that is a part of the name, as in RETURN_TO_IDLE_LOOP.
  static std::optional<std::string> longestWithin(std::string_view name,
                                                  const std::vector<std::string_view>& candidates) {
    std::string_view longest;
    for (const std::string_view candidate : candidates) {
      const bool isWithin = name.find(candidate) != std::string_view::npos;
      if (isWithin && candidate.size() > longest.size()) longest = candidate;
    }
    return longest.empty() ? std::nullopt : std::optional<std::string>(longest);
  }

  void add(Finding finding, const ScriptList& list, const ValueRef<>& where) {
    finding.list = list.key;
    finding.where = where;
    findings_.push_back(std::move(finding));
  }

  const Script& script_;
  toolkit::Toolkit& toolkit_;
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> readScript(const Script& script, toolkit::Toolkit& toolkit) {
  return Reader(script, toolkit).findings();
}

}  // namespace qz::tools::check
