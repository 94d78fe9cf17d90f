// SPDX-License-Identifier: MIT
// Everything about a widget that a walk-through can change, as a table.
#pragma once

#include <QVariant>
#include <cstdint>
#include <span>
#include <vector>

class QObject;
class QWidget;

namespace qz::toolkit::qt {

/// What a command changes about a widget. Hidden and enabled are also what hosts change in return;
/// focus is the window's; places are the pages, docks, panes and scrolled places around a widget;
/// the size changes only when Qt lays the form out.
enum class Aspect : std::uint8_t {
  tag,
  layer,
  contents,
  choice,
  hidden,
  enabled,
  focus,
  place,
  size
};

/// One thing about a widget, or about an action.
struct Facet {
  /// Returns the present value; invalid if the object has no such thing. Values can be compared.
  QVariant (*read)(QObject& object);
  /// Restores a value that `read` returned.
  void (*write)(QObject& object, const QVariant& value);
  Aspect aspect = Aspect::contents;
};

/// Returns all facets of widgets. Their objects are widgets. Restore the later ones first: they may
/// change the earlier ones too.
std::span<const Facet> facets();

/// Returns the facet that is the size of a window.
const Facet& sizeFacet();

/// Returns all widgets around `widget`, up to the window, beginning with itself.
std::vector<QWidget*> widgetsAround(QWidget& widget);

/// Returns the first of the buttons of which only one can be on, which include `widget`; null if
/// it is on or off by itself.
QWidget* firstOfChoiceWith(QWidget& widget);

/// Whether hosts listen to changes of the widget's state or text.
bool isHeardByHosts(const QWidget& widget);

}  // namespace qz::toolkit::qt
