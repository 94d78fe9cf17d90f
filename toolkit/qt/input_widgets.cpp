// SPDX-License-Identifier: MIT
// Some classes count even without the focus, because they react to the mouse.

#include "toolkit/qt/input_widgets.hpp"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QAbstractSlider>
#include <QAbstractSpinBox>
#include <QCalendarWidget>
#include <QComboBox>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QPlainTextEdit>
#include <QSplitterHandle>
#include <QTabBar>
#include <QTabWidget>
#include <QTextEdit>
#include <QToolBox>

namespace qz::toolkit::qt {

namespace {

template <class... Classes>
bool isOneOf(const QWidget& widget) {
  return (qobject_cast<const Classes*>(&widget) || ...);
}

}  // namespace

bool takesInput(const QWidget& widget) {
  if (const auto* const box = qobject_cast<const QGroupBox*>(&widget)) return box->isCheckable();
  return widget.focusPolicy() != Qt::NoFocus ||
         isOneOf<QAbstractButton, QAbstractItemView, QAbstractSlider, QAbstractSpinBox,
                 QCalendarWidget, QComboBox, QKeySequenceEdit, QLineEdit, QMenu, QMenuBar,
                 QPlainTextEdit, QSplitterHandle, QTabBar, QTabWidget, QTextEdit, QToolBox>(widget);
}

}  // namespace qz::toolkit::qt
