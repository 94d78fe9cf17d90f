// SPDX-License-Identifier: MIT
// What the toolkit hangs on a widget to remember and draw what Qt's own widgets cannot.
//
// A decoration is a child of its widget, so it lives as long as what a script showed there is to be
// seen, with or without an engine, and goes when the widget goes or the host shows something else.
// There is at most one of a class on a widget.
#pragma once

#include <QObject>
#include <QWidget>
#include <typeinfo>

namespace toolkit::qt {

/// The decoration of the very class D on `widget`; null when there is none.
template <class D>
D* decorationOn(const QWidget& widget) {
  for (QObject* child : widget.children()) {
    if (typeid(*child) == typeid(D)) return static_cast<D*>(child);
  }
  return nullptr;
}

/// The same, made where there is none. D's constructor takes the widget.
template <class D, class W>
D& decorated(W& widget) {
  if (auto* const decoration = decorationOn<D>(widget)) return *decoration;
  return *new D(widget);  // owned by the widget
}

}  // namespace toolkit::qt
