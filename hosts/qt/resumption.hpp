// SPDX-License-Identifier: MIT
// Where a walk-through is, as a value that settings can keep.
#pragma once

#include <QVariantMap>
#include <string>
#include <vector>

#include "hosts/qt/journal.hpp"
#include "qz/property_list/collections.hpp"

namespace qz::hosts::qt {

/// The steps to make again, or why that is not possible.
struct Resumption {
  std::vector<JournalStep> steps;
  std::string problem;  ///< empty if there is none
};

QVariantMap stateOf(const QVariant& script, const std::vector<JournalStep>& steps);

/// Reads the steps of a state for a script with these lists.
Resumption resumptionOf(const QVariantMap& state, const toolkit::Dictionary& lists);

}  // namespace qz::hosts::qt
