// SPDX-License-Identifier: MIT
// Fragments are put in place before a step is read, so a step does not know that it uses any.
#include "tools/steps/fragments.hpp"

#include <vector>

#include "tools/steps/words.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {
namespace {

// A fragment may use others, but not itself.
constexpr std::size_t deepestUse = 20;

/// Returns the text with an argument for each parameter, which is a name in braces. What is in
/// braces and is not a parameter stays.
std::string filledIn(const std::string& text, const std::map<std::string, NodeRef>& arguments) {
  std::string filled;
  for (std::size_t i = 0; i < text.size();) {
    const std::size_t end = text[i] == '{' ? text.find('}', i) : std::string::npos;
    const auto argument = end == std::string::npos
                              ? arguments.end()
                              : arguments.find(text.substr(i + 1, end - i - 1));
    if (argument == arguments.end()) {
      filled += text[i++];
    } else {
      filled += argument->second->text;
      i = end + 1;
    }
  }
  return filled;
}

NodeRef withArguments(const NodeRef& node, const std::map<std::string, NodeRef>& arguments) {
  const auto copy = std::make_shared<Node>(*node);
  if (node->kind == Node::Kind::scalar) copy->text = filledIn(node->text, arguments);
  for (NodeRef& element : copy->elements) element = withArguments(element, arguments);
  for (auto& [key, value] : copy->entries) {
    key = withArguments(key, arguments);
    value = withArguments(value, arguments);
  }
  return copy;
}

}  // namespace

void Fragments::read(const NodeRef& table) {
  for (const auto& [key, body] : entriesOf(*table, "a table of fragments", mistakes_)) {
    if (body->kind != Node::Kind::table) {
      mistakes_.add(body->place,
                    "expected what steps have in common (a table), found " + foundWords(*body));
    } else {
      bodies_[key->text] = body;
    }
  }
}

NodeRef Fragments::expand(const NodeRef& body) const {
  if (body->kind != Node::Kind::table) return body;
  const auto expanded =
      std::make_shared<Node>(Node{.kind = Node::Kind::table, .place = body->place});
  expandInto(body, 0, *expanded);
  return expanded;
}

void Fragments::expandInto(const NodeRef& body, std::size_t depth, Node& into) const {
  const auto entries = entriesOf(*body, "a table", mistakes_);
  for (const auto& [key, value] : entries) {
    if (key->text == words::use) use(value, depth, into);
  }
  for (const auto& entry : entries) {
    if (entry.first->text != words::use) into.entries.push_back(entry);
  }
}

void Fragments::use(const NodeRef& what, std::size_t depth, Node& into) const {
  switch (what->kind) {
    case Node::Kind::scalar:
      return useOne(what, nullptr, depth, into);
    case Node::Kind::list:
      for (const NodeRef& element : what->elements) use(element, depth, into);
      return;
    case Node::Kind::table:
      for (const auto& [name, arguments] : what->entries) useOne(name, arguments, depth, into);
      return;
    case Node::Kind::nothing:
      break;
  }
  mistakes_.add(what->place, "expected the name of a fragment, found nothing");
}

void Fragments::useOne(const NodeRef& name, const NodeRef& arguments, std::size_t depth,
                       Node& into) const {
  const auto found = bodies_.find(name->text);
  if (found == bodies_.end()) {
    std::vector<std::string_view> names;
    for (const auto& [known, body] : bodies_) names.push_back(known);
    mistakes_.add(name->place,
                  "no fragment is called " + quote(name->text) + didYouMean(name->text, names));
    return;
  }
  if (depth == deepestUse) {
    mistakes_.add(name->place, "the fragment " + quote(name->text) + " uses itself");
    return;
  }
  Arguments given;
  if (arguments) {
    for (const auto& [parameter, value] :
         entriesOf(*arguments, "a table of arguments", mistakes_)) {
      given[parameter->text] = value;
    }
  }
  expandInto(given.empty() ? found->second : withArguments(found->second, given), depth + 1, into);
}

}  // namespace qz::tools::steps
