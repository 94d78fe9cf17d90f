// SPDX-License-Identifier: MIT
#include "tools/storyboard/map_layout.hpp"

#ifdef QZ_GRAPHVIZ
#include <graphviz/gvc.h>

#include <array>
#include <cstdio>
#include <memory>
#endif

namespace qz::tools::storyboard {

#ifdef QZ_GRAPHVIZ
namespace {

constexpr double pointsOfAnInch = 72;

struct GraphEnd {
  GVC_t* context;
  void operator()(Agraph_t* graph) const {
    gvFreeLayout(context, graph);
    agclose(graph);
  }
};

/// The library takes texts that it does not change as if it did.
class Text {
 public:
  explicit Text(std::string text) : text_(std::move(text)) {}
  operator char*() { return text_.data(); }  // NOLINT(google-explicit-constructor)

 private:
  std::string text_;
};

std::string inches(double points) { return std::to_string(points / pointsOfAnInch); }

class Layouter {
 public:
  explicit Layouter(const MapGraph& map)
      : map_(map),
        context_(gvContext(), gvFreeContext),
        graph_(agopen(Text("map"), Agdirected, nullptr), GraphEnd{context_.get()}) {}

  MapLayout layOut() {
    setDefaults();
    for (std::size_t i = 0; i < map_.nodes; ++i) {
      nodes_.push_back(agnode(graph_.get(), Text(std::to_string(i)), 1));
    }
    for (const auto& [from, to] : map_.edges) {
      edges_.push_back(agedge(graph_.get(), nodes_[from], nodes_[to], nullptr, 1));
    }
    gvLayout(context_.get(), graph_.get(), "dot");
    return read();
  }

 private:
  void setDefaults() {
    const auto set = [&](int kind, const char* name, const std::string& value) {
      agattr(graph_.get(), kind, Text(name), Text(value));
    };
    set(AGNODE, "shape", "box");
    set(AGNODE, "label", "");
    set(AGNODE, "fixedsize", "true");
    set(AGNODE, "width", inches(map_.width));
    set(AGNODE, "height", inches(map_.height));
    set(AGRAPH, "ranksep", "0.5");
    set(AGRAPH, "nodesep", "0.3");
  }

  MapLayout read() const {
    const boxf box = GD_bb(graph_.get());
    MapLayout layout{.width = box.UR.x, .height = box.UR.y};
    for (Agnode_t* const node : nodes_) {
      const pointf middle = ND_coord(node);
      const double top = layout.height - middle.y - map_.height / 2;
      layout.nodes.emplace_back(middle.x - map_.width / 2, top);
    }
    for (Agedge_t* const edge : edges_) layout.edges.push_back(pathOf(edge, layout.height));
    return layout;
  }

  static std::string pathOf(Agedge_t* edge, double height) {
    const splines* const lines = ED_spl(edge);
    if (!lines || lines->size == 0) return "";
    const bezier& line = lines->list[0];
    std::string path;
    for (std::size_t i = 0; i < static_cast<std::size_t>(line.size); ++i) {
      path += i == 0 ? "M" : i == 1 ? "C" : " ";
      path += wordsOf(line.list[i], height);
    }
    if (line.eflag) path += "L" + wordsOf(line.ep, height);
    return path;
  }

  static std::string wordsOf(const pointf& point, double height) {
    std::array<char, 64> text{};
    std::snprintf(text.data(), text.size(), "%.1f,%.1f", point.x, height - point.y);
    return text.data();
  }

  const MapGraph& map_;
  std::unique_ptr<GVC_t, int (*)(GVC_t*)> context_;
  std::unique_ptr<Agraph_t, GraphEnd> graph_;
  std::vector<Agnode_t*> nodes_;
  std::vector<Agedge_t*> edges_;
};

}  // namespace

std::optional<MapLayout> layOut(const MapGraph& graph) { return Layouter(graph).layOut(); }
#else
std::optional<MapLayout> layOut(const MapGraph&) { return std::nullopt; }
#endif

}  // namespace qz::tools::storyboard
