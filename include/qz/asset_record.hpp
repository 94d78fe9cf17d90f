// SPDX-License-Identifier: MIT
// The record that the engine keeps of each control of an adopted window.
#pragma once

#include <array>
#include <string>

#include "qz/api.hpp"
#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/view.hpp"

namespace qz {

/// A control at the time of its discovery: its class name (a list of one), its frame (x, y, width,
/// height, in single precision) and the control itself, which its window owns.
struct QZ_API AssetRecord {
  std::array<std::string, 1> classNames;      ///< in a list of one
  std::array<float, 4> frame{};               ///< x, y, width and height
  toolkit::StoredRef<toolkit::View> control;  ///< absent when it is gone
};

}  // namespace qz
