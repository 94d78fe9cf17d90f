// SPDX-License-Identifier: MIT
// Everything about a widget that a walk-through can change, as a table.
#pragma once

#include <QVariant>
#include <span>
#include <vector>

class QWidget;

namespace qz::toolkit::qt {

/// One thing about a widget.
struct Facet {
  /// Returns the present value; invalid if the widget has no such thing. Values can be compared.
  QVariant (*read)(QWidget& widget);
  /// Restores a value that `read` returned.
  void (*write)(QWidget& widget, const QVariant& value);
};

/// Returns all facets. Restore the later ones first: they may change the earlier ones too.
std::span<const Facet> facets();

/// Returns the widgets of which a change of `widget` can change a facet: the widget, the first of
/// the buttons of which only one can be on, and all widgets around it, up to the window.
std::vector<QWidget*> widgetsConcernedBy(QWidget& widget);

}  // namespace qz::toolkit::qt
