// SPDX-License-Identifier: MIT
// A source that was built, and is played on the engine by a user's own means.
#pragma once

#include <filesystem>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "tests/steps/places.hpp"
#include "tools/steps/script_file.hpp"
#include "tools/walkthrough/stage.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::meaning {

/// A built source with all that is needed to play it.
struct PlayableSource {
  std::string folder{};  ///< of the images
  toolkit::ValueRef<toolkit::Dictionary> script{};
  std::string startKey{};
  tools::walkthrough::StagePlan plan{};
};

/// One play from its start, with the user's clicks.
class Play {
 public:
  explicit Play(const PlayableSource& source);

  tools::walkthrough::StepPicture picture();
  void click(std::size_t control);
  void letPass(double seconds) { driver_.advance(seconds); }

 private:
  drivers::MemoryDriver driver_{};
  std::unique_ptr<tools::walkthrough::Stage> stage_{};
};

/// Returns what the window looks like, in the interpreter's terms. What nobody can see is as
/// expected: the rest of a hidden control, and the style of an empty text.
Look seen(const tools::walkthrough::StepPicture& picture, const Look& expected);

/// Returns all that the picture shows to a user, in words, except states and what is pressed in.
std::string everythingSeen(const tools::walkthrough::StepPicture& picture);

/// Returns everything that may matter later, in words.
std::string everythingKept(const tools::walkthrough::StepPicture& picture);

/// Returns the first control on which the looks differ, in words; empty if they are the same.
std::string difference(const Look& expected, const Look& seen);

}  // namespace qz::meaning
