// SPDX-License-Identifier: MIT
// The map of a page: its steps as a graph.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/storyboard/page.hpp"

namespace qz::tools::storyboard {

struct MapNode {
  double x = 0;          ///< of the left edge, in points
  double y = 0;          ///< from the top, in points
  std::size_t step = 0;  ///< of the page; of several, the first
  std::string title{};
};

struct MapEdge {
  std::size_t from = 0;
  std::size_t to = 0;
  std::string line{};      ///< the data of an SVG path
  std::string severity{};  ///< of the worst finding whose path goes along it; empty: there is none
};

struct PageMap {
  double width = 0;        ///< in points
  double height = 0;       ///< the same
  double nodeWidth = 0;    ///< the same
  double nodeHeight = 0;   ///< the same
  bool isGrouped = false;  ///< a node stands for all steps of a group
  std::vector<MapNode> nodes{};
  std::vector<MapEdge> edges{};
  std::vector<std::size_t> nodeOfStep{};
};

/// Returns the map of a page: absent if this build lays out no graphs.
std::optional<PageMap> mapOf(const Page& page);

}  // namespace qz::tools::storyboard
