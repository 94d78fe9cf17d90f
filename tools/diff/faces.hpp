// SPDX-License-Identifier: MIT
// Faces: what situations of two walk-throughs show, so far as their windows have the same controls.
#pragma once

#include <cstdint>
#include <map>
#include <vector>

#include "tools/comparison/behavior.hpp"
#include "tools/diff/controls.hpp"

namespace qz::tools::diff {

using comparison::Appearance;
using comparison::Behavior;
using comparison::Situation;
using comparison::SituationIndex;

using FaceIndex = std::uint32_t;

/// The two walk-throughs. They share a table of looks.
using Behaviors = Both<const Behavior*>;

class Faces {
 public:
  Faces(const Behaviors& behaviors, const JointControls& controls);

  FaceIndex of(Side side, SituationIndex situation) const { return numbers_[side][situation]; }
  std::size_t count() const { return faces_.size(); }
  /// Returns the situations with a face, in the order of their finding.
  const Both<std::vector<SituationIndex>>& situations(FaceIndex face) const {
    return situations_[face];
  }
  /// Whether the walk-through is over.
  bool isOver(FaceIndex face) const { return faces_[face]->isOver; }

  /// Returns how many controls look different, the background counting as one; `far` if one of them
  /// is the end.
  std::size_t distance(FaceIndex one, FaceIndex other) const;
  /// Whether two faces may be those of one step that was changed. If not, moves that lead to them
  /// lead elsewhere: to what another step shows, or nearly. `haveOneName` says whether both steps
  /// have the same name.
  bool mayBeOneStep(const Both<FaceIndex>& faces, bool haveOneName);

  static constexpr std::size_t far = static_cast<std::size_t>(-1);

 private:
  struct Face {
    bool isOver = false;
    comparison::LookValue background = 0;
    std::vector<Appearance> controls{};
    friend auto operator<=>(const Face&, const Face&) = default;
  };

  Face faceOf(Side side, const Situation& situation, const JointControls& controls) const;
  FaceIndex add(Side side, Face face);
  /// Returns the distance to the nearest face of the other side.
  std::size_t nearest(Side side, FaceIndex face);

  std::map<Face, FaceIndex> known_;
  std::vector<const Face*> faces_;
  std::vector<Both<std::vector<SituationIndex>>> situations_;
  Both<std::vector<FaceIndex>> numbers_;
  Both<std::vector<FaceIndex>> all_;  // each once, in the order of their finding
  Both<std::map<FaceIndex, std::size_t>> nearest_;
};

}  // namespace qz::tools::diff
