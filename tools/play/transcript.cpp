// SPDX-License-Identifier: MIT
// The transcript of a walk-through.
#include "tools/play/transcript.hpp"

#include <ostream>
#include <utility>

#include "tools/play/picture_diff.hpp"

namespace qz::tools::play {

void Transcript::beginStep(std::string_view what) {
  ++steps_;
  for (const auto& [out, style] : outputs_) {
    if (steps_ > 1) out << '\n';
    out << renderHeading(steps_, what, style) << std::flush;
  }
}

void Transcript::note(std::string_view words) {
  for (const Output& output : outputs_) output.out << "  " << words << '\n';
}

void Transcript::endStep(StepPicture picture) {
  const PictureChanges changes = diffPictures(latest_, picture);
  for (const auto& [out, style] : outputs_) {
    out << renderPicture(picture, changes, style) << std::flush;
  }
  latest_ = std::move(picture);
}

void Transcript::paragraph(std::string_view text) {
  for (const Output& output : outputs_) output.out << '\n' << text << std::flush;
}

}  // namespace qz::tools::play
