// SPDX-License-Identifier: MIT
// Fragments: parts of steps that are written once, with parameters.
#pragma once

#include <map>
#include <string>

#include "tools/steps/yaml.hpp"

namespace qz::tools::steps {

/// Puts fragments in the place of the entries `use`.
class Fragments {
 public:
  explicit Fragments(Mistakes& mistakes) : mistakes_(mistakes) {}

  /// Reads the table of all fragments; what is wrong with it is a mistake.
  void read(const NodeRef& table);
  /// Returns the body of a step with the entries of the fragments that it uses, each with the
  /// arguments in place of its parameters. The body's own entries come last.
  NodeRef expand(const NodeRef& body) const;

 private:
  using Arguments = std::map<std::string, NodeRef>;

  void use(const NodeRef& what, std::size_t depth, Node& into) const;
  void useOne(const NodeRef& name, const NodeRef& arguments, std::size_t depth, Node& into) const;
  void expandInto(const NodeRef& body, std::size_t depth, Node& into) const;

  Mistakes& mistakes_;
  std::map<std::string, NodeRef> bodies_;
};

}  // namespace qz::tools::steps
