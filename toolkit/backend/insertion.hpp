// SPDX-License-Identifier: MIT
// The rules for adding a view to another: what raises.
#pragma once

#include <string_view>

#include "qz/toolkit/ref.hpp"
#include "qz/toolkit/view.hpp"

namespace qz::toolkit {

/// Raises if `view` is absent or belongs to another toolkit. `receiver` is the class name of the
/// view that gets it.
void requireOwnView(std::string_view receiver, const Ref<View>& view, bool isOwn);

/// Raises if the view is the content view of a window, or is the receiver or contains it.
void requireFreeView(std::string_view receiver, bool isContentView, bool isAroundReceiver);

}  // namespace qz::toolkit
