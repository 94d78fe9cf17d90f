// SPDX-License-Identifier: MIT
// Arrows are behind the nodes. Tab passes the nodes by: the list of steps has the same links.
#include "tools/storyboard/map_html.hpp"

#include "tools/play/words.hpp"
#include "tools/storyboard/markup.hpp"

namespace qz::tools::storyboard {
namespace {

std::string pixels(const char* property, double points) {
  return std::string(property) + ":" + play::numberWords(points) + "px";
}

class MapWriter {
 public:
  MapWriter(const Page& page, const PageMap& map) : page_(page), map_(map) {}

  std::string write() {
    text_ = "<details id=\"_map\"><summary>Map</summary>\n<div class=\"tools\">\n" +
            button("larger", "Larger") + button("smaller", "Smaller") +
            button("whole", "Whole map") + remark() +
            "</div>\n<div class=\"map\" tabindex=\"0\" role=\"group\" aria-label=\"Map of the "
            "steps\">\n<div class=\"sheet\" style=\"" +
            pixels("width", map_.width) + ";" + pixels("height", map_.height) + "\">\n";
    writeEdges();
    for (std::size_t i = 0; i < map_.nodes.size(); ++i) writeNode(i);
    text_ += "</div>\n</div>\n</details>\n";
    return std::move(text_);
  }

 private:
  static std::string button(const std::string& id, const std::string& words) {
    return "<button type=\"button\" id=\"_" + id + "\">" + words + "</button>\n";
  }

  std::string remark() const {
    if (!map_.isGrouped) return "";
    return "<p>There are more than 300 steps, so each picture stands for all steps of a "
           "list.</p>\n";
  }

  void writeEdges() {
    text_ += "<svg aria-hidden=\"true\" viewBox=\"0 0 " + play::numberWords(map_.width) + " " +
             play::numberWords(map_.height) +
             "\"><defs><marker id=\"_tip\" viewBox=\"0 0 8 8\" refX=\"7\" refY=\"4\" "
             "markerWidth=\"8\" markerHeight=\"8\" orient=\"auto\"><path d=\"M0,0L8,4L0,8Z\" "
             "fill=\"context-stroke\"/></marker></defs>\n";
    for (const MapEdge& edge : map_.edges) {
      text_ += "<path class=\"edge " + edge.severity + "\" data-from=\"" +
               std::to_string(edge.from) + "\" data-to=\"" + std::to_string(edge.to) +
               "\" marker-end=\"url(#_tip)\" d=\"" + edge.line + "\"/>\n";
    }
    text_ += "</svg>\n";
  }

  void writeNode(std::size_t index) {
    const MapNode& node = map_.nodes[index];
    const PageStep& step = page_.steps[node.step];
    text_ += "<a class=\"node\" tabindex=\"-1\" dir=\"auto\" href=\"#" + step.name.id +
             "\" data-node=\"" + std::to_string(index) + "\" style=\"" + pixels("left", node.x) +
             ";" + pixels("top", node.y) + ";" + pixels("width", map_.nodeWidth) + ";" +
             pixels("height", map_.nodeHeight) + "\">";
    if (step.isDrawn) text_ += "<span class=\"thumbnail drawn\">" + patchesOf(step) + "</span>";
    text_ += "<span class=\"title\">" + html(node.title) + "</span></a>\n";
  }

  const Page& page_;
  const PageMap& map_;
  std::string text_;
};

}  // namespace

std::string patchesOf(const PageStep& step) {
  std::string spans;
  for (const std::size_t patch : step.patches) {
    spans += "<span class=\"patch p" + std::to_string(patch) + "\"></span>";
  }
  return spans;
}

std::string htmlOf(const Page& page, const PageMap& map) { return MapWriter(page, map).write(); }

}  // namespace qz::tools::storyboard
