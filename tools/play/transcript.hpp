// SPDX-License-Identifier: MIT
// The transcript of a walk-through: a heading for every step, what happened in it, and a picture of
// what shows afterwards, compared with the picture before.
#pragma once

#include <iosfwd>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/play/picture_render.hpp"
#include "tools/play/step_picture.hpp"

namespace tools::play {

class Transcript {
 public:
  /// `out` outlives the transcript.
  Transcript(std::ostream& out, const Style& style) : outputs_{{out, style}} {}

  /// From now on it is also written there. `out` outlives the transcript.
  void alsoTo(std::ostream& out, const Style& style) { outputs_.push_back({out, style}); }

  /// What shows before the first step.
  void startFrom(StepPicture picture) { latest_ = std::move(picture); }

  /// Begins a step. Everything is out before this returns, so that log lines come below it.
  void beginStep(std::string_view what);
  /// A line about the step.
  void note(std::string_view words);
  void endStep(StepPicture picture);

  /// Text that stands apart from the steps: begins after an empty line.
  void paragraph(std::string_view text);

  /// What showed at the end of the last step.
  const StepPicture& latest() const { return latest_; }

 private:
  struct Output {
    std::ostream& out;
    Style style;
  };

  std::vector<Output> outputs_;
  StepPicture latest_;
  int steps_ = 0;
};

}  // namespace tools::play
