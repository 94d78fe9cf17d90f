// SPDX-License-Identifier: MIT
// Reads and restores the facets of widgets.

#include "toolkit/qt/facets.hpp"

#include <QAbstractButton>
#include <QAbstractScrollArea>
#include <QButtonGroup>
#include <QCoreApplication>
#include <QDockWidget>
#include <QKeySequence>
#include <QLabel>
#include <QLayout>
#include <QLineEdit>
#include <QMainWindow>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QPixmap>
#include <QPlainTextEdit>
#include <QPointer>
#include <QScrollBar>
#include <QSplitter>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTextEdit>
#include <QToolBar>
#include <QToolBox>
#include <algorithm>
#include <optional>

#include "toolkit/qt/adopted_form.hpp"
#include "toolkit/qt/button_look.hpp"
#include "toolkit/qt/check_state.hpp"
#include "toolkit/qt/hiding.hpp"
#include "toolkit/qt/image_look.hpp"
#include "toolkit/qt/text_look.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

namespace {

/// A widget that may be deleted.
struct Pick {
  QPointer<QWidget> widget;
  friend bool operator==(const Pick& a, const Pick& b) {
    return a.widget.data() == b.widget.data();
  }
};

QVariant pick(QWidget* widget) { return QVariant::fromValue(Pick{widget}); }
QWidget* picked(const QVariant& value) { return value.value<Pick>().widget; }

// --- every widget ---

QVariant readTagProperty(QWidget& widget) {
  const QVariant tag = widget.property(tagProperty);
  return tag.isValid() ? QVariantList{tag} : QVariantList();
}

void writeTagProperty(QWidget& widget, const QVariant& value) {
  const QVariantList tag = value.toList();
  widget.setProperty(tagProperty, tag.isEmpty() ? QVariant() : tag.front());
}

QVariant readName(QWidget& widget) { return widget.accessibleName(); }
void writeName(QWidget& widget, const QVariant& value) {
  widget.setAccessibleName(value.toString());
}

QVariant readDescription(QWidget& widget) { return widget.accessibleDescription(); }
void writeDescription(QWidget& widget, const QVariant& value) {
  widget.setAccessibleDescription(value.toString());
}

QVariant readToolTip(QWidget& widget) { return widget.toolTip(); }
void writeToolTip(QWidget& widget, const QVariant& value) { widget.setToolTip(value.toString()); }

// Stacks and tool boxes hide and show their pages themselves. But somebody may hide a current page.
bool isOtherPage(const QWidget& widget) {
  const auto* const stack = qobject_cast<QStackedWidget*>(widget.parentWidget());
  const bool isTab = stack && qobject_cast<QTabWidget*>(stack->parentWidget());
  return (stack && !isTab && stack->currentWidget() != &widget) ||
         qobject_cast<QToolBox*>(widget.parentWidget());
}

bool isLaidOut(const QList<int>& panes) {
  return std::any_of(panes.begin(), panes.end(), [](int size) { return size > 0; });
}

struct HiddenState {
  bool isHidden = false;
  QRect place;       // layouts do not look after hidden widgets
  QList<int> panes;  // of the splitter around the widget: a hidden pane loses its room
  friend bool operator==(const HiddenState& a, const HiddenState& b) {
    return a.isHidden == b.isHidden;
  }
};

QVariant readHidden(QWidget& widget) {
  if (!isPartOfForm(widget) || isOtherPage(widget)) return {};
  const auto* const splitter = qobject_cast<QSplitter*>(widget.parentWidget());
  return QVariant::fromValue(HiddenState{isHiddenInForm(widget), widget.geometry(),
                                         splitter ? splitter->sizes() : QList<int>()});
}

void writeHidden(QWidget& widget, const QVariant& value) {
  const auto state = value.value<HiddenState>();
  setHiddenInForm(widget, state.isHidden);
  if (state.isHidden) widget.setGeometry(state.place);
  auto* const splitter = qobject_cast<QSplitter*>(widget.parentWidget());
  if (splitter && isLaidOut(state.panes)) splitter->setSizes(state.panes);
}

QVariant readEnabled(QWidget& widget) {
  if (!isPartOfForm(widget)) return {};
  return widget.isEnabledTo(widget.parentWidget());
}
void writeEnabled(QWidget& widget, const QVariant& value) { widget.setEnabled(value.toBool()); }

// A window's.
QVariant readFocus(QWidget& widget) {
  return widget.isWindow() ? pick(widget.focusWidget()) : QVariant();
}

void writeFocus(QWidget& widget, const QVariant& value) {
  if (QWidget* const focused = picked(value)) {
    focused->setFocus(Qt::OtherFocusReason);
  } else if (QWidget* const present = widget.focusWidget()) {
    present->clearFocus();
  }
}

struct LayerState {
  bool isLayered = false;
  Ref<Image> image;
  friend bool operator==(const LayerState& a, const LayerState& b) {
    return a.isLayered == b.isLayered && a.image == b.image;
  }
};

QVariant readLayer(QWidget& widget) {
  return QVariant::fromValue(LayerState{isLayered(widget), layerContents(widget)});
}

void writeLayer(QWidget& widget, const QVariant& value) {
  const auto layer = value.value<LayerState>();
  setLayered(widget, layer.isLayered);
  showLayerContents(widget, layer.image);
}

// --- buttons ---

QAbstractButton* asQtButton(QWidget& widget) { return qobject_cast<QAbstractButton*>(&widget); }

struct TitleState {
  QString text;
  QKeySequence shortcut;
  std::optional<AttributedString> styled;
  friend bool operator==(const TitleState&, const TitleState&) = default;
};

QVariant readTitle(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  if (!button) return {};
  return QVariant::fromValue(TitleState{button->text(), button->shortcut(), styledTitle(*button)});
}

void writeTitle(QWidget& widget, const QVariant& value) {
  auto& button = *asQtButton(widget);
  const auto title = value.value<TitleState>();
  if (title.styled) return showTitle(button, *title.styled);
  restoreTitle(button, title.text);
  if (button.shortcut() != title.shortcut) button.setShortcut(title.shortcut);
}

QVariant readFace(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  return button ? QVariant::fromValue(faceColor(*button)) : QVariant();
}
void writeFace(QWidget& widget, const QVariant& value) {
  setFaceColor(*asQtButton(widget), value.value<std::optional<Color>>());
}

QVariant readHighlight(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  return button ? QVariant(isHighlighted(*button)) : QVariant();
}
void writeHighlight(QWidget& widget, const QVariant& value) {
  setHighlighted(*asQtButton(widget), value.toBool());
}

bool excludesSiblings(const QAbstractButton& button) {
  return button.autoExclusive() && !button.group();
}

QList<QAbstractButton*> exclusiveSiblingsOf(const QAbstractButton& button) {
  QList<QAbstractButton*> siblings;
  if (!button.parentWidget() || !excludesSiblings(button)) return siblings;
  for (auto* const child : button.parentWidget()->findChildren<QAbstractButton*>(
           QString(), Qt::FindDirectChildrenOnly)) {
    if (excludesSiblings(*child)) siblings.push_back(child);
  }
  return siblings;
}

// Returns the buttons of which only one can be on, among them `button`; none if it is on or off by
// itself.
QList<QAbstractButton*> choiceWith(const QAbstractButton& button) {
  if (button.group()) {
    return button.group()->exclusive() ? button.group()->buttons() : QList<QAbstractButton*>();
  }
  return exclusiveSiblingsOf(button);
}

QVariant readCheck(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  if (!button || !button->isCheckable() || !choiceWith(*button).isEmpty()) return {};
  return static_cast<int>(checkState(*button));
}
void writeCheck(QWidget& widget, const QVariant& value) {
  setCheckState(*asQtButton(widget), static_cast<State>(value.toInt()));
}

QAbstractButton* chosenOf(const QList<QAbstractButton*>& buttons) {
  const auto chosen =
      std::find_if(buttons.begin(), buttons.end(),
                   [](const QAbstractButton* button) { return button->isChecked(); });
  return chosen == buttons.end() ? nullptr : *chosen;
}

// That of the first of the buttons of which only one can be on.
QVariant readChoice(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  if (!button) return {};
  const auto choice = choiceWith(*button);
  if (choice.isEmpty() || choice.front() != button) return {};
  return pick(chosenOf(choice));
}

void writeChoice(QWidget& widget, const QVariant& value) {
  if (auto* const chosen = qobject_cast<QAbstractButton*>(picked(value))) {
    chosen->setChecked(true);
  } else if (auto* const present = chosenOf(choiceWith(*asQtButton(widget)))) {
    setCheckState(*present, State::off);
  }
}

// --- labels and edits ---

struct LabelState {
  QString text;  // of a styled text, Qt's own: it depends on the palette
  Qt::TextFormat format = Qt::AutoText;
  std::optional<AttributedString> styled;
  QPixmap pixmap;
  Ref<Image> image;
  bool tracksMouse = false;  // Qt turns this on with a rich text, and never off
  friend bool operator==(const LabelState& a, const LabelState& b) {
    return a.styled == b.styled && a.pixmap.cacheKey() == b.pixmap.cacheKey() &&
           a.image == b.image && (a.styled || (a.text == b.text && a.format == b.format));
  }
};

QVariant readLabel(QWidget& widget) {
  const auto* const label = qobject_cast<QLabel*>(&widget);
  if (!label) return {};
  return QVariant::fromValue(LabelState{label->text(), label->textFormat(), styledText(widget),
                                        label->pixmap(Qt::ReturnByValue), shownImage(*label),
                                        label->hasMouseTracking()});
}

void showLabel(QLabel& label, const LabelState& state) {
  dropStyledText(label);
  dropImage(label);
  label.setTextFormat(state.format);
  if (state.image) return showImage(label, state.image);
  if (!state.pixmap.isNull()) return label.setPixmap(state.pixmap);
  if (state.styled) return showText(label, *state.styled);
  label.clear();  // a label with a pixmap may ignore an empty text
  label.setText(state.text);
}

void writeLabel(QWidget& widget, const QVariant& value) {
  const auto state = value.value<LabelState>();
  showLabel(static_cast<QLabel&>(widget), state);
  widget.setMouseTracking(state.tracksMouse);
}

struct LineState {
  QString text;
  bool isModified = false;
  int cursor = 0;
  friend bool operator==(const LineState& a, const LineState& b) { return a.text == b.text; }
};

QVariant readLine(QWidget& widget) {
  const auto* const line = qobject_cast<QLineEdit*>(&widget);
  if (!line) return {};
  return QVariant::fromValue(LineState{line->text(), line->isModified(), line->cursorPosition()});
}

void writeLine(QWidget& widget, const QVariant& value) {
  auto& line = static_cast<QLineEdit&>(widget);
  const auto state = value.value<LineState>();
  line.setText(state.text);
  line.setModified(state.isModified);
  line.setCursorPosition(state.cursor);
}

/// The text of an edit of several lines.
struct PageState {
  QString plain;
  QString html;  // empty for a plain text edit
  bool isModified = false;
  int cursor = 0;
  friend bool operator==(const PageState& a, const PageState& b) {
    return a.plain == b.plain && a.html == b.html;
  }
};

template <class Edit>
PageState pageOf(const Edit& edit, const QString& html) {
  return {edit.toPlainText(), html, edit.document()->isModified(), edit.textCursor().position()};
}

template <class Edit>
void placeCursor(Edit& edit, const PageState& page) {
  edit.document()->setModified(page.isModified);
  auto cursor = edit.textCursor();
  cursor.setPosition(page.cursor);
  edit.setTextCursor(cursor);
}

QVariant readPage(QWidget& widget) {
  if (const auto* const edit = qobject_cast<QTextEdit*>(&widget)) {
    return QVariant::fromValue(pageOf(*edit, edit->toHtml()));
  }
  const auto* const edit = qobject_cast<QPlainTextEdit*>(&widget);
  return edit ? QVariant::fromValue(pageOf(*edit, {})) : QVariant();
}

// A text without formats is restored as such: HTML would name formats that it does not have.
void writePage(QWidget& widget, const QVariant& value) {
  const auto page = value.value<PageState>();
  if (auto* const edit = qobject_cast<QTextEdit*>(&widget)) {
    edit->setPlainText(page.plain);
    if (edit->toHtml() != page.html) edit->setHtml(page.html);
    placeCursor(*edit, page);
  } else if (auto* const plainEdit = qobject_cast<QPlainTextEdit*>(&widget)) {
    plainEdit->setPlainText(page.plain);
    placeCursor(*plainEdit, page);
  }
}

// What an edit wears for its styled text. It goes even if the user has changed the text since.
QVariant readDress(QWidget& widget) {
  if (!showsText(widget) || qobject_cast<QLabel*>(&widget)) return {};
  return QVariant::fromValue(styledText(widget));
}

void writeDress(QWidget& widget, const QVariant& value) {
  const auto styled = value.value<std::optional<AttributedString>>();
  styled ? showText(widget, *styled) : dropStyledText(widget);
}

// --- places ---

// The stack of a tab widget follows the tabs.
QVariant readPageShown(QWidget& widget) {
  if (const auto* const tabs = qobject_cast<QTabWidget*>(&widget)) {
    return pick(tabs->currentWidget());
  }
  if (const auto* const box = qobject_cast<QToolBox*>(&widget)) return pick(box->currentWidget());
  const auto* const stack = qobject_cast<QStackedWidget*>(&widget);
  const bool isFree = stack && !qobject_cast<QTabWidget*>(stack->parentWidget());
  return isFree ? pick(stack->currentWidget()) : QVariant();
}

template <class Pages>
void showPageOf(QWidget& widget, QWidget* page) {
  auto* const pages = qobject_cast<Pages*>(&widget);
  if (pages && page && pages->indexOf(page) >= 0) pages->setCurrentWidget(page);
}

void writePageShown(QWidget& widget, const QVariant& value) {
  showPageOf<QTabWidget>(widget, picked(value));
  showPageOf<QToolBox>(widget, picked(value));
  showPageOf<QStackedWidget>(widget, picked(value));
}

// Equal if the same panes are collapsed: sizes also change with the splitter's.
struct PaneState {
  QList<int> sizes;
  friend bool operator==(const PaneState& a, const PaneState& b) {
    return std::equal(a.sizes.begin(), a.sizes.end(), b.sizes.begin(), b.sizes.end(),
                      [](int one, int other) { return (one == 0) == (other == 0); });
  }
};

// Nothing if the splitter has not been laid out yet, as on a page that nobody has seen.
QVariant readPanes(QWidget& widget) {
  const auto* const splitter = qobject_cast<QSplitter*>(&widget);
  if (!splitter) return {};
  const auto sizes = splitter->sizes();
  return isLaidOut(sizes) ? QVariant::fromValue(PaneState{sizes}) : QVariant();
}
void writePanes(QWidget& widget, const QVariant& value) {
  static_cast<QSplitter&>(widget).setSizes(value.value<PaneState>().sizes);
}

QVariant readScroll(QWidget& widget) {
  const auto* const area = qobject_cast<QAbstractScrollArea*>(&widget);
  if (!area) return {};
  return QPoint(area->horizontalScrollBar()->value(), area->verticalScrollBar()->value());
}

void writeScroll(QWidget& widget, const QVariant& value) {
  const auto& area = static_cast<QAbstractScrollArea&>(widget);
  area.horizontalScrollBar()->setValue(value.toPoint().x());
  area.verticalScrollBar()->setValue(value.toPoint().y());
}

// A window's. Qt enlarges it when its layout needs more room.
QVariant readSize(QWidget& widget) { return widget.size(); }

// Lets the layouts of the widget, and of all widgets in it, forget what they needed before. Qt
// leaves those of pages that are not shown for later.
void layOut(QWidget& widget) {
  for (QObject* const child : QObjectList(widget.children())) {
    auto* const inner = qobject_cast<QWidget*>(child);
    if (inner && isPartOfForm(*inner)) layOut(*inner);
  }
  if (QLayout* const layout = widget.layout()) {
    layout->invalidate();
    layout->activate();
  }
  widget.updateGeometry();
  QCoreApplication::sendPostedEvents(&widget, QEvent::LayoutRequest);
}

void writeSize(QWidget& widget, const QVariant& value) {
  layOut(widget);
  widget.resize(value.toSize());
  layOut(widget);
}

// Returns the dock and those that share its place.
QList<QDockWidget*> docksAt(QDockWidget& dock) {
  const auto* const mainWindow = qobject_cast<QMainWindow*>(dock.parentWidget());
  auto docks = mainWindow ? mainWindow->tabifiedDockWidgets(&dock) : QList<QDockWidget*>();
  if (!docks.isEmpty()) docks.push_back(&dock);
  return docks;
}

QVariant readFrontDock(QWidget& widget) {
  auto* const dock = qobject_cast<QDockWidget*>(&widget);
  if (!dock) return {};
  const auto docks = docksAt(*dock);
  const auto front = std::find_if(docks.begin(), docks.end(), [](const QDockWidget* one) {
    return !one->visibleRegion().isEmpty();
  });
  return front == docks.end() ? QVariant() : pick(*front);
}

void writeFrontDock(QWidget&, const QVariant& value) {
  if (QWidget* const front = picked(value)) front->raise();
}

QVariant readSubWindow(QWidget& widget) {
  const auto* const area = qobject_cast<QMdiArea*>(&widget);
  return area ? pick(area->currentSubWindow()) : QVariant();
}

void writeSubWindow(QWidget& widget, const QVariant& value) {
  auto* const window = qobject_cast<QMdiSubWindow*>(picked(value));
  if (window) static_cast<QMdiArea&>(widget).setActiveSubWindow(window);
}

template <auto read, auto write>
constexpr Facet ofWidgets(Aspect aspect) {
  return {
      [](QObject& widget) { return read(static_cast<QWidget&>(widget)); },
      [](QObject& widget, const QVariant& value) { write(static_cast<QWidget&>(widget), value); },
      aspect};
}

}  // namespace

std::span<const Facet> facets() {
  static constexpr Facet table[] = {
      ofWidgets<readFocus, writeFocus>(
          Aspect::focus),  // a widget that is hidden or disabled cannot take it
      ofWidgets<readScroll, writeScroll>(Aspect::place),
      ofWidgets<readSize, writeSize>(Aspect::size),
      ofWidgets<readTagProperty, writeTagProperty>(Aspect::tag),
      ofWidgets<readName, writeName>(Aspect::contents),
      ofWidgets<readDescription, writeDescription>(Aspect::contents),
      ofWidgets<readToolTip, writeToolTip>(Aspect::contents),
      ofWidgets<readHidden, writeHidden>(Aspect::hidden),
      ofWidgets<readEnabled, writeEnabled>(Aspect::enabled),
      ofWidgets<readLayer, writeLayer>(Aspect::layer),
      ofWidgets<readCheck, writeCheck>(Aspect::contents),
      ofWidgets<readChoice, writeChoice>(Aspect::choice),
      ofWidgets<readFace, writeFace>(Aspect::contents),
      ofWidgets<readHighlight, writeHighlight>(Aspect::contents),
      ofWidgets<readTitle, writeTitle>(Aspect::contents),
      ofWidgets<readLabel, writeLabel>(Aspect::contents),
      ofWidgets<readLine, writeLine>(Aspect::contents),
      ofWidgets<readPage, writePage>(Aspect::contents),
      ofWidgets<readDress, writeDress>(Aspect::contents),
      ofWidgets<readPanes, writePanes>(Aspect::place),
      ofWidgets<readPageShown, writePageShown>(Aspect::place),
      ofWidgets<readFrontDock, writeFrontDock>(Aspect::place),
      ofWidgets<readSubWindow, writeSubWindow>(Aspect::place),
  };
  return table;
}

const Facet& sizeFacet() {
  const auto table = facets();
  return *std::find_if(table.begin(), table.end(),
                       [](const Facet& facet) { return facet.aspect == Aspect::size; });
}

bool isHeardByHosts(const QWidget& widget) {
  const auto* const button = qobject_cast<const QAbstractButton*>(&widget);
  return (button && button->isCheckable()) ||
         (showsText(widget) && !qobject_cast<const QLabel*>(&widget));
}

std::vector<QWidget*> widgetsAround(QWidget& widget) {
  std::vector<QWidget*> widgets{&widget};
  while (isPartOfForm(*widgets.back()) && widgets.back()->parentWidget()) {
    widgets.push_back(widgets.back()->parentWidget());
  }
  return widgets;
}

QWidget* firstOfChoiceWith(QWidget& widget) {
  const auto* const button = asQtButton(widget);
  const auto choice = button ? choiceWith(*button) : QList<QAbstractButton*>();
  return choice.isEmpty() ? nullptr : choice.front();
}

}  // namespace qz::toolkit::qt
