// SPDX-License-Identifier: MIT
// Reads single values of a source. What is wrong is noted, and reading continues.
#include "tools/steps/words.hpp"

#include <set>

#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::steps {
namespace {

void expect(const Node& node, std::string_view expected, Mistakes& mistakes) {
  mistakes.add(node.place, "expected " + std::string(expected) + ", found " + foundWords(node));
}

}  // namespace

std::string foundWords(const Node& node) {
  switch (node.kind) {
    case Node::Kind::scalar:
      return node.text.empty() ? "an empty text" : quoteStart(node.text);
    case Node::Kind::list:
      return "a list";
    case Node::Kind::table:
      return "a table";
    case Node::Kind::nothing:
      break;
  }
  return "nothing";
}

std::vector<std::pair<NodeRef, NodeRef>> entriesOf(const Node& node, std::string_view expected,
                                                   Mistakes& mistakes) {
  if (node.kind != Node::Kind::table) {
    expect(node, expected, mistakes);
    return {};
  }
  std::vector<std::pair<NodeRef, NodeRef>> entries;
  std::set<std::string_view> keys;
  for (const auto& entry : node.entries) {
    const Node& key = *entry.first;
    if (key.kind != Node::Kind::scalar || key.text.empty()) {
      expect(key, "a name before the colon", mistakes);
    } else if (!keys.insert(key.text).second) {
      mistakes.add(key.place, quote(key.text) + " is here twice; expected one entry of this name");
    } else {
      entries.push_back(entry);
    }
  }
  return entries;
}

std::optional<std::string> textOf(const Node& node, std::string_view expected, Mistakes& mistakes) {
  if (node.kind == Node::Kind::scalar) return node.text;
  expect(node, expected, mistakes);
  return std::nullopt;
}

std::optional<bool> flagOf(const Node& node, Mistakes& mistakes) {
  if (node.text == "yes" || node.text == "true") return true;
  if (node.text == "no" || node.text == "false") return false;
  expect(node, "yes or no", mistakes);
  return std::nullopt;
}

std::optional<int> numberOf(const Node& node, int least, int most, std::string_view expected,
                            Mistakes& mistakes) {
  const auto number = walkthrough::parseNumber<int>(node.text);
  if (number && *number >= least && *number <= most) return number;
  expect(node,
         std::string(expected) + " (a whole number from " + std::to_string(least) + " to " +
             std::to_string(most) + ")",
         mistakes);
  return std::nullopt;
}

std::optional<std::size_t> choiceOf(const Node& node, std::span<const std::string_view> choices,
                                    Mistakes& mistakes) {
  for (std::size_t i = 0; i < choices.size(); ++i) {
    if (node.kind == Node::Kind::scalar && node.text == choices[i]) return i;
  }
  const std::vector<std::string> names(choices.begin(), choices.end());
  expect(node, enumerate(names), mistakes);
  return std::nullopt;
}

}  // namespace qz::tools::steps
