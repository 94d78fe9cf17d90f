// SPDX-License-Identifier: MIT
// Writes what a running window is as a file for `qz-walkthrough`.
#pragma once

#include <QByteArray>

#include "qz/toolkit/window.hpp"

namespace qz::hosts::qt {

/// Returns an XML property list that describes a window and its controls, which
/// docs/host-windows.md explains.
QByteArray descriptionOf(const toolkit::Ref<toolkit::Window>& window);

}  // namespace qz::hosts::qt
