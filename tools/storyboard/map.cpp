// SPDX-License-Identifier: MIT
#include "tools/storyboard/map.hpp"

#include <map>
#include <string_view>

#include "tools/storyboard/map_layout.hpp"

namespace qz::tools::storyboard {
namespace {

constexpr std::size_t mostNodes = 300;  // more steps are shown in groups
constexpr double nodeWidth = 150;       // points
constexpr double titleHeight = 40;      // the same

using Link = std::pair<std::size_t, std::size_t>;

/// Returns the more severe of two severities; an empty one is none.
const std::string& worse(const std::string& a, const std::string& b) {
  constexpr std::string_view rising = "note warning error";
  const auto rank = [&](const std::string& each) {
    return each.empty() ? 0 : rising.find(each) + 1;
  };
  return rank(a) < rank(b) ? b : a;
}

class MapMaker {
 public:
  explicit MapMaker(const Page& page) : page_(page) {
    map_.isGrouped = page.steps.size() > mostNodes;
    map_.nodeWidth = nodeWidth;
    map_.nodeHeight = titleHeight + pictureHeight();
  }

  std::optional<PageMap> make() {
    addNodes();
    addLinks();
    markFindings();
    return layOutAll() ? std::optional(std::move(map_)) : std::nullopt;
  }

 private:
  double pictureHeight() const {
    if (page_.ground.empty()) return 0;
    const auto& content = page_.steps.front().picture.window->content;
    return nodeWidth * content.height / content.width;
  }

  void addNodes() {
    std::map<std::string, std::size_t> groups;
    for (std::size_t i = 0; i < page_.steps.size(); ++i) {
      const PageStep& step = page_.steps[i];
      const std::string& key = map_.isGrouped ? step.group : step.name.id;
      const auto [known, isNew] = groups.try_emplace(key, map_.nodes.size());
      map_.nodeOfStep.push_back(known->second);
      if (isNew) map_.nodes.push_back({.step = i, .title = step.name.title});
    }
  }

  void addLinks() {
    for (std::size_t i = 0; i < page_.steps.size(); ++i) {
      for (const PageMove& move : page_.steps[i].moves) {
        if (move.to.step) addLink(i, *move.to.step);
      }
    }
  }

  void addLink(std::size_t from, std::size_t to) {
    const Link link{map_.nodeOfStep[from], map_.nodeOfStep[to]};
    if (link.first != link.second) severities_[link];
  }

  void markFindings() {
    for (const PageFinding& finding : page_.findings) {
      for (std::size_t i = 1; i < finding.path.size(); ++i) {
        const auto from = finding.path[i - 1].second.step;
        const auto to = finding.path[i].second.step;
        const auto link = from && to
                              ? severities_.find({map_.nodeOfStep[*from], map_.nodeOfStep[*to]})
                              : severities_.end();
        if (link != severities_.end()) link->second = worse(link->second, finding.severity);
      }
    }
  }

  bool layOutAll() {
    MapGraph graph{.nodes = map_.nodes.size(), .width = map_.nodeWidth, .height = map_.nodeHeight};
    for (const auto& [link, severity] : severities_) graph.edges.push_back(link);
    const auto layout = layOut(graph);
    if (!layout) return false;
    map_.width = layout->width;
    map_.height = layout->height;
    for (std::size_t i = 0; i < map_.nodes.size(); ++i) {
      std::tie(map_.nodes[i].x, map_.nodes[i].y) = layout->nodes[i];
    }
    for (auto line = layout->edges.begin(); const auto& [link, severity] : severities_) {
      map_.edges.push_back({link.first, link.second, *line++, severity});
    }
    return true;
  }

  const Page& page_;
  PageMap map_;
  std::map<Link, std::string> severities_;  // of the links between nodes
};

}  // namespace

std::optional<PageMap> mapOf(const Page& page) { return MapMaker(page).make(); }

}  // namespace qz::tools::storyboard
