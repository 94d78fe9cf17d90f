// SPDX-License-Identifier: MIT
// The tree of a YAML document, each node with its place.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/steps/place.hpp"

namespace qz::tools::steps {

struct Node;

/// An alias refers to the node of its anchor, so a node can be in several places of the tree.
using NodeRef = std::shared_ptr<const Node>;

struct Node {
  enum class Kind { nothing, scalar, list, table };
  Kind kind = Kind::nothing;
  Place place = 0;
  std::string text{};                                  ///< of a scalar
  std::vector<NodeRef> elements{};                     ///< of a list
  std::vector<std::pair<NodeRef, NodeRef>> entries{};  ///< of a table, in the order of the source
  std::size_t size = 1;  ///< how many nodes it holds, those of aliases each time
};

/// Reads the only document of `text`, whose first byte is at `begin`. Null, and a mistake, if the
/// text is not YAML, or if its aliases repeat much more than is written.
NodeRef readYaml(std::string_view text, Place begin, Mistakes& mistakes);

}  // namespace qz::tools::steps
