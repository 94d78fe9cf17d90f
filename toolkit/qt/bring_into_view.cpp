// SPDX-License-Identifier: MIT
// Opens tabs, pages, docks and panes, and scrolls.

#include "toolkit/qt/bring_into_view.hpp"

#include <QDockWidget>
#include <QLayout>
#include <QMainWindow>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QScrollArea>
#include <QSplitter>
#include <QStackedWidget>
#include <QTabWidget>
#include <QToolBar>
#include <QToolBox>
#include <algorithm>

#include "toolkit/qt/adopted_form.hpp"

namespace qz::toolkit::qt {

namespace {

template <class W>
W* above(const QWidget& widget) {
  return qobject_cast<W*>(widget.parentWidget());
}

// A tab widget keeps its pages in a stack, which does not tell the tabs of its changes.
void openPage(QWidget& page) {
  auto* const stack = above<QStackedWidget>(page);
  if (!stack) return;
  if (auto* const tabs = above<QTabWidget>(*stack)) return tabs->setCurrentWidget(&page);
  stack->setCurrentWidget(&page);
}

// A tool box keeps each page in a scroll area.
void openToolBoxPage(QWidget& page) {
  const QWidget* const viewport = page.parentWidget();
  const auto* const area = viewport ? above<QScrollArea>(*viewport) : nullptr;
  auto* const box = area ? above<QToolBox>(*area) : nullptr;
  if (box && box->indexOf(&page) >= 0) box->setCurrentWidget(&page);
}

void openPanel(QWidget& panel) {
  auto* const dock = qobject_cast<QDockWidget*>(&panel);
  if ((dock || qobject_cast<QToolBar*>(&panel)) && panel.isHidden()) panel.show();
  const auto* const mainWindow = dock ? above<QMainWindow>(*dock) : nullptr;
  if (mainWindow && !mainWindow->tabifiedDockWidgets(dock).isEmpty()) dock->raise();
}

// Another sub-window may cover it.
void openSubWindow(QWidget& widget) {
  auto* const window = qobject_cast<QMdiSubWindow*>(&widget);
  if (window && window->mdiArea()) window->mdiArea()->setActiveSubWindow(window);
}

int lengthAlong(Qt::Orientation orientation, const QSize& size) {
  return orientation == Qt::Horizontal ? size.width() : size.height();
}

// Takes the room for a collapsed pane from the largest one.
void openPane(QWidget& pane) {
  auto* const splitter = above<QSplitter>(pane);
  const int index = splitter ? splitter->indexOf(&pane) : -1;
  if (index < 0 || pane.isHidden()) return;
  QList<int> sizes = splitter->sizes();
  const auto largest = std::max_element(sizes.begin(), sizes.end());
  if (sizes[index] > 0 || *largest == 0) return;
  const int wanted =
      lengthAlong(splitter->orientation(), pane.sizeHint().expandedTo(pane.minimumSizeHint()));
  const int given = std::clamp(wanted, 1, std::max(1, *largest / 2));
  *largest -= given;
  sizes[index] = given;
  splitter->setSizes(sizes);
}

// `inner` is the target or a widget around it.
void scrollTo(QWidget& target, const QWidget& inner) {
  auto* const viewport = inner.parentWidget();
  auto* const area = viewport ? above<QScrollArea>(*viewport) : nullptr;
  if (area && area->widget() == &inner) area->ensureWidgetVisible(&target, 0, 0);
}

void openPlacesOf(QWidget& widget, QWidget& target) {
  QWidget* const around = isPartOfForm(widget) ? widget.parentWidget() : nullptr;
  if (around) openPlacesOf(*around, target);
  openPanel(widget);
  openSubWindow(widget);
  openPage(widget);
  openToolBoxPage(widget);
  openPane(widget);
  if (QLayout* const layout = widget.layout()) layout->activate();  // before scrolling there
  scrollTo(target, widget);
}

}  // namespace

void bringIntoView(QWidget& widget) { openPlacesOf(widget, widget); }

}  // namespace qz::toolkit::qt
