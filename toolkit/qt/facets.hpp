// SPDX-License-Identifier: MIT
// Everything about a widget that a walk-through can change, as a table.
#pragma once

#include <QVariant>
#include <cstdint>
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
  /// When it changes: with the widget that a command changes or one around it; also when the host
  /// reacts to a change of any other widget; only when Qt lays the form out.
  enum class Reach : std::uint8_t { near, form, layout } reach = Reach::near;
};

/// Returns all facets. Restore the later ones first: they may change the earlier ones too.
std::span<const Facet> facets();

/// Returns the facet that is the size of a window.
const Facet& sizeFacet();

/// Returns the widgets of which a change of `widget` can change a facet: the widget, the first of
/// the buttons of which only one can be on, and all widgets around it, up to the window.
std::vector<QWidget*> widgetsConcernedBy(QWidget& widget);

/// Whether hosts listen to changes of the widget's state or text.
bool isHeardByHosts(const QWidget& widget);

}  // namespace qz::toolkit::qt
