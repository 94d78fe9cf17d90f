// SPDX-License-Identifier: MIT
#include "tools/diff/faces.hpp"

#include <algorithm>

namespace qz::tools::diff {
namespace {

// Of very many faces the first ones are enough to find what a move leads to instead.
constexpr std::size_t mostCompared = 2000;

}  // namespace

Faces::Faces(const Behaviors& behaviors, const JointControls& controls) {
  for (const Side side : bothSides) {
    const auto& situations = behaviors[side]->situations();
    for (SituationIndex i = 0; i < situations.size(); ++i) {
      const FaceIndex face = add(side, faceOf(side, situations[i], controls));
      numbers_[side].push_back(face);
      situations_[face][side].push_back(i);
    }
  }
}

Faces::Face Faces::faceOf(Side side, const Situation& situation,
                          const JointControls& controls) const {
  Face face{.isOver = situation.isOver, .background = situation.background};
  for (std::size_t i = 0; i < controls.count() && !face.isOver; ++i) {
    const JointControl& control = controls[i];
    if (control.before && control.after)
      face.controls.push_back(situation.controls[*control[side]]);
  }
  return face;
}

FaceIndex Faces::add(Side side, Face face) {
  const auto next = static_cast<FaceIndex>(faces_.size());
  const auto [known, isNew] = known_.try_emplace(std::move(face), next);
  if (isNew) {
    faces_.push_back(&known->first);
    situations_.emplace_back();
  }
  if (situations_[known->second][side].empty()) all_[side].push_back(known->second);
  return known->second;
}

std::size_t Faces::distance(FaceIndex one, FaceIndex other) const {
  const Face& a = *faces_[one];
  const Face& b = *faces_[other];
  if (a.isOver != b.isOver) return far;
  std::size_t distance = a.background == b.background ? 0 : 1;
  for (std::size_t i = 0; i < a.controls.size(); ++i) distance += a.controls[i] != b.controls[i];
  return distance;
}

std::size_t Faces::nearest(Side side, FaceIndex face) {
  const auto [known, isNew] = nearest_[side].try_emplace(face, far);
  if (!isNew) return known->second;
  const auto& others = all_[otherThan(side)];
  for (std::size_t i = 0; i < std::min(others.size(), mostCompared); ++i) {
    known->second = std::min(known->second, distance(face, others[i]));
  }
  return known->second;
}

bool Faces::mayBeOneStep(const Both<FaceIndex>& faces, bool haveOneName) {
  const auto [before, after] = faces;
  const std::size_t own = distance(before, after);
  if (own == 0) return true;
  if (own == far) return false;
  if (haveOneName) return true;
  const bool isThereNow = !situations_[before].after.empty();
  const bool wasThere = !situations_[after].before.empty();
  if (isThereNow || wasThere) return false;
  if (own == 1) return true;
  const std::size_t one = nearest(Side::before, before);
  const std::size_t other = nearest(Side::after, after);
  const bool bothHaveNearer = one < own && other < own;
  const bool oneHasMuchNearer = 3 * std::min(one, other) <= own;
  return !bothHaveNearer && !oneHasMuchNearer;
}

}  // namespace qz::tools::diff
