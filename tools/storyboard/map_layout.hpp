// SPDX-License-Identifier: MIT
// Lays graphs out for maps.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace qz::tools::storyboard {

/// Nodes of one size, and arrows between them.
struct MapGraph {
  std::size_t nodes = 0;
  double width = 0;                                          ///< of a node, in points
  double height = 0;                                         ///< the same
  std::vector<std::pair<std::size_t, std::size_t>> edges{};  ///< no two the same
};

/// Where everything is, in points; the origin is at the top left.
struct MapLayout {
  double width = 0;
  double height = 0;
  std::vector<std::pair<double, double>> nodes{};  ///< the left upper corners
  std::vector<std::string> edges{};                ///< the data of SVG paths, as in the graph
};

/// Returns the layout, with most arrows pointing down; absent if this build is without Graphviz.
std::optional<MapLayout> layOut(const MapGraph& graph);

}  // namespace qz::tools::storyboard
