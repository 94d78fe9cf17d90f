// SPDX-License-Identifier: MIT
// Objects that the toolkit attaches to a widget to remember and draw what Qt's own widgets cannot.
//
// A decoration is a child of its widget. It lives while the content that a script has set is
// visible, with or without an engine, and ends with the widget or when the host shows something
// else. A widget has at most one decoration of each class.
#pragma once

#include <QObject>
#include <QWidget>
#include <typeinfo>

namespace qz::toolkit::qt {

/// Returns the widget's decoration of exactly class D; null if there is none.
template <class D>
D* decorationOn(const QWidget& widget) {
  for (QObject* child : widget.children()) {
    if (typeid(*child) == typeid(D)) return static_cast<D*>(child);
  }
  return nullptr;
}

/// Like `decorationOn`, but makes the decoration if there is none. D's constructor takes the
/// widget.
template <class D, class W>
D& decorated(W& widget) {
  if (auto* const decoration = decorationOn<D>(widget)) return *decoration;
  return *new D(widget);  // owned by the widget
}

}  // namespace qz::toolkit::qt
