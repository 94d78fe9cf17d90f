// SPDX-License-Identifier: MIT
// The transcript of a walk-through: a heading for every step, what happened in it, and a picture of
// the window afterwards, compared with the picture before.
#pragma once

#include <iosfwd>
#include <string_view>
#include <utility>
#include <vector>

#include "tools/play/picture_render.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::play {

using namespace walkthrough;

class Transcript {
 public:
  /// Writes nothing, and keeps only the latest picture.
  Transcript() = default;
  /// `out` must outlive the transcript.
  Transcript(std::ostream& out, const Style& style) : outputs_{{out, style}} {}

  /// From now on, also writes to `out`, which must outlive the transcript.
  void alsoTo(std::ostream& out, const Style& style) { outputs_.push_back({out, style}); }

  /// Sets the picture before the first step.
  void startFrom(StepPicture picture) { latest_ = std::move(picture); }

  /// Begins a step. Flushes the output, so that log lines come below it.
  void beginStep(std::string_view what);
  /// Adds a line about the step.
  void note(std::string_view words);
  void endStep(StepPicture picture);

  /// Adds text that does not belong to a step, after an empty line.
  void paragraph(std::string_view text);

  /// Returns the picture at the end of the last step.
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

}  // namespace qz::tools::play
