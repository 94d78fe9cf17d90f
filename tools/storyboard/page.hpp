// SPDX-License-Identifier: MIT
// A page of steps to click through, as one HTML file.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "tools/storyboard/step_names.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::storyboard {

/// Where a move leads, or a finding is seen.
struct PageTarget {
  std::optional<std::size_t> step{};  ///< of the page; absent: the page does not have it
  std::string title{};                ///< of the step; empty: there is none
};

struct PageMove {
  std::optional<std::size_t> control{};  ///< that is pressed; absent: the first timer fires
  std::string argument{};                ///< of `play`, such as "--press 12"
  PageTarget to{};
};

struct SourceLine {
  std::size_t number = 0;  ///< from 1
  std::string text{};
  bool isMarked = false;  ///< it made the step
};

/// A part of a script.
struct SourceExcerpt {
  std::string path{};
  std::vector<SourceLine> lines{};
};

struct PageStep {
  StepName name{};
  std::string group{};  ///< the step of the source, or the list that had the last word
  walkthrough::StepPicture picture{};
  bool isDrawn = false;                ///< on the page's ground; else the page shows texts
  std::vector<std::size_t> patches{};  ///< of the page, over its ground
  std::string command{};               ///< that plays a shortest way to here
  std::vector<PageMove> moves{};
  std::vector<SourceExcerpt> source{};
};

/// A part of pictures, which may be in several.
struct PagePatch {
  toolkit::Rect area{};  ///< in shares of the window from the *top* left: 0 to 1
  std::string png{};
};

struct PageFinding {
  std::string severity{};
  std::string code{};
  std::string message{};
  std::string place{};
  std::string help{};
  std::vector<std::pair<std::string, PageTarget>> path{};  ///< the moves in words
};

struct Page {
  std::string title{};
  std::vector<std::string> remarks{};  ///< sentences about the whole
  std::vector<PageStep> steps{};       ///< the first is a start
  std::string ground{};                ///< a PNG file that is behind all pictures; or empty
  std::vector<PagePatch> patches{};    ///< no two the same
  std::vector<PageFinding> findings{};
};

/// Returns the page as an HTML document, the same bytes for the same page.
std::string htmlOf(const Page& page);

}  // namespace qz::tools::storyboard
