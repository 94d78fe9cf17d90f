// The transcript of a walk-through.
#include "tools/play/transcript.hpp"

#include <ostream>
#include <utility>

#include "tools/play/picture_diff.hpp"

namespace tools::play {

void Transcript::beginStep(std::string_view what) {
  if (steps_ > 0) out_ << '\n';
  out_ << renderHeading(++steps_, what, style_) << std::flush;
}

void Transcript::note(std::string_view words) { out_ << "  " << words << '\n'; }

void Transcript::endStep(StepPicture picture) {
  out_ << renderPicture(picture, diffPictures(latest_, picture), style_) << std::flush;
  latest_ = std::move(picture);
}

void Transcript::paragraph(std::string_view text) { out_ << '\n' << text << std::flush; }

}  // namespace tools::play
