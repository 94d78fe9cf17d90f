// SPDX-License-Identifier: MIT
// Writes a script that drives every widget of a form.
#pragma once

#include <QWidget>
#include <string>
#include <vector>

namespace qz::foreign_forms {

/// Returns a script in which every widget is changed in every way that commands can change it. The
/// tag of a widget is 1 + its position in `widgets`. The first list changes all of them, and turns
/// on all buttons; the list of a button changes it again, and then disables or hides it.
std::string scriptFor(const std::vector<QWidget*>& widgets);

/// Returns the tooltip of the widget with that tag after the first list, and after a press.
std::string tipAtStart(std::size_t tag);
std::string tipWhenPressed(std::size_t tag);

}  // namespace qz::foreign_forms
