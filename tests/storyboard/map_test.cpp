// SPDX-License-Identifier: MIT
// The map of a page: every step, or every group of very many, with the ways to findings.
#include "tools/storyboard/map.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace qz::tools::storyboard {
namespace {

/// Returns a page of steps without windows, in groups of a hundred, each of which leads to the
/// next.
Page longPage(std::size_t steps) {
  Page page;
  for (std::size_t i = 0; i < steps; ++i) {
    const std::string group = std::to_string(i / 100);
    PageStep step{.name = {"step-" + std::to_string(i), "Step " + std::to_string(i)},
                  .group = "list " + group};
    if (i + 1 < steps) {
      step.moves.push_back({.control = 0, .to = {.step = i + 1, .title = "Next"}});
    }
    step.moves.push_back({.control = 1, .to = {.title = "Left out"}});
    page.steps.push_back(std::move(step));
  }
  return page;
}

/// Returns a finding that is seen after some steps.
PageFinding findingAlong(const std::string& severity, const std::vector<std::size_t>& steps) {
  PageFinding finding{.severity = severity};
  for (const std::size_t step : steps) finding.path.emplace_back("", PageTarget{.step = step});
  return finding;
}

/// Returns the severity of the arrow between two nodes.
std::string severityOf(const PageMap& map, std::size_t from, std::size_t to) {
  const auto found = std::find_if(map.edges.begin(), map.edges.end(), [&](const MapEdge& edge) {
    return edge.from == from && edge.to == to;
  });
  return found == map.edges.end() ? "no arrow" : found->severity;
}

/// Maps of builds with Graphviz.
class Maps : public testing::Test {
 protected:
  void SetUp() override {
    if (!mapOf(longPage(1))) GTEST_SKIP() << "this build lays out no graphs";
  }
};

TEST_F(Maps, HaveANodeForEachStep) {
  const PageMap map = *mapOf(longPage(3));
  EXPECT_FALSE(map.isGrouped);
  ASSERT_EQ(map.nodes.size(), 3U);
  EXPECT_EQ(map.nodes[2].title, "Step 2");
  EXPECT_EQ(map.nodeHeight, 40) << "without a picture only the title";
  EXPECT_LT(map.nodes[0].y, map.nodes[1].y) << "arrows point down";
  for (const MapNode& node : map.nodes) {
    EXPECT_GE(node.x, -0.5);
    EXPECT_GE(node.y, -0.5);
    EXPECT_LE(node.x + map.nodeWidth, map.width + 0.5);
    EXPECT_LE(node.y + map.nodeHeight, map.height + 0.5);
  }
  ASSERT_EQ(map.edges.size(), 2U) << "a step that is left out has no arrow";
  EXPECT_TRUE(map.edges[0].line.starts_with("M"));
  EXPECT_EQ(htmlOf(longPage(3)).find("so each picture stands"), std::string::npos);
}

TEST_F(Maps, OfMoreThan300StepsAreGroupedAndSaySo) {
  EXPECT_EQ(mapOf(longPage(300))->nodes.size(), 300U);
  const Page page = longPage(301);
  const PageMap map = *mapOf(page);
  EXPECT_TRUE(map.isGrouped);
  ASSERT_EQ(map.nodes.size(), 4U);
  EXPECT_EQ(map.nodes[1].step, 100U) << "the first of its steps";
  EXPECT_EQ(map.nodeOfStep[199], 1U);
  EXPECT_EQ(map.edges.size(), 3U) << "none from a group to itself";
  const std::string html = htmlOf(page);
  EXPECT_NE(html.find("There are more than 300 steps, so each picture stands for all steps of a "
                      "list."),
            std::string::npos);
  EXPECT_NE(html.find("<section id=\"step-300\" class=\"step\" data-command=\"\" data-node=\"3\">"),
            std::string::npos);
}

TEST_F(Maps, MarkTheWaysToFindingsWithTheWorst) {
  Page page = longPage(5);
  page.findings = {findingAlong("error", {0, 1}), findingAlong("note", {0, 1, 2, 3}),
                   findingAlong("warning", {1, 2})};
  page.findings.push_back(findingAlong("error", {2, 3}));
  page.findings.back().path[1].second.step.reset();
  const PageMap map = *mapOf(page);
  EXPECT_EQ(severityOf(map, 0, 1), "error");
  EXPECT_EQ(severityOf(map, 1, 2), "warning");
  EXPECT_EQ(severityOf(map, 2, 3), "note") << "the page leaves out the end of the other way";
  EXPECT_EQ(severityOf(map, 3, 4), "");
  EXPECT_NE(htmlOf(page).find("<path class=\"edge error\" data-from=\"0\" data-to=\"1\""),
            std::string::npos);
}

TEST_F(Maps, OfOneStepAreAllRight) {
  const PageMap map = *mapOf(longPage(1));
  ASSERT_EQ(map.nodes.size(), 1U);
  EXPECT_TRUE(map.edges.empty());
  EXPECT_NEAR(map.width, map.nodeWidth, 0.5);
}

}  // namespace
}  // namespace qz::tools::storyboard
