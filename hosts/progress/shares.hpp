// SPDX-License-Identifier: MIT
// How much of the shortest way to the end is done at each place of an exploration.
#pragma once

#include <string>
#include <unordered_map>

#include "qz/progress_meter.hpp"
#include "tools/exploration/exploration.hpp"

namespace qz::hosts::progress {

/// Shares by the signature of the window.
using Shares = std::unordered_map<std::string, double>;

/// Returns a text that differs for windows that differ in what an outline holds.
std::string signatureOf(const WindowOutline& window);

/// Returns the shares of all places before the end from which the shortest way is certain, even if
/// the exploration is not complete.
Shares sharesOf(const tools::check::Exploration& exploration);

}  // namespace qz::hosts::progress
