// SPDX-License-Identifier: MIT
// Finds the controls of an adopted window.

#include "toolkit/qt/adopted_form.hpp"

#include <QAction>
#include <QDockWidget>
#include <QMainWindow>
#include <QMenu>
#include <QResizeEvent>
#include <QStackedWidget>
#include <QToolBar>
#include <QVariant>
#include <algorithm>
#include <utility>

#include "toolkit/qt/action_stand_in.hpp"
#include "toolkit/qt/bring_into_view.hpp"
#include "toolkit/qt/hiding.hpp"
#include "toolkit/qt/strings.hpp"
#include "toolkit/qt/widget_node.hpp"

namespace qz::toolkit::qt {

namespace {

// Quicker than `property` for the many objects without dynamic properties.
bool hasTagProperty(const QObject& object) {
  const auto names = object.dynamicPropertyNames();
  return std::any_of(names.begin(), names.end(),
                     [](const QByteArray& name) { return name == tagProperty; });
}

// Returns the child as a widget; null if it is none, or if it is deleted while its siblings wait
// for the same.
QWidget* widgetAt(QObject* child) {
  return child && child->isWidgetType() ? static_cast<QWidget*>(child) : nullptr;
}

bool isInToolBarOf(const QWidget& window, const QAction& action) {
  const auto places = action.associatedObjects();
  return std::any_of(places.begin(), places.end(), [&](const QObject* place) {
    const auto* const bar = qobject_cast<const QToolBar*>(place);
    return bar && window.isAncestorOf(bar);
  });
}

bool showsAction(const QObject& control, const QAction& action) {
  const auto* const widget = qobject_cast<const QWidget*>(&control);
  return widget && actionShownBy(*widget) == &action;
}

bool isReached(const QObject& object, const std::vector<QObject*>& controls) {
  const auto* const action = qobject_cast<const QAction*>(&object);
  return std::any_of(controls.begin(), controls.end(), [&](const QObject* control) {
    return control == &object || (action && showsAction(*control, *action));
  });
}

bool isPanel(const QWidget& widget) { return widget.property(panelProperty).toBool(); }

// True if the widget is hidden for itself, and not as a page that is not the current one.
bool isKeptHidden(const QWidget& widget) {
  return widget.isHidden() && !qobject_cast<const QStackedWidget*>(widget.parentWidget());
}

}  // namespace

bool isPartOfForm(const QWidget& widget) {
  return !widget.isWindow() || qobject_cast<const QDockWidget*>(&widget) ||
         qobject_cast<const QToolBar*>(&widget) || qobject_cast<const QMenu*>(&widget) ||
         isPanel(widget);
}

bool Listing::hasAllPages() const {
  return std::all_of(stacks.begin(), stacks.end(), [](const auto& entry) {
    return entry.first && entry.first->count() == entry.second;
  });
}

AdoptedForm::AdoptedForm(QWidget& window, Adoption how) : window_(&window), how_(std::move(how)) {
  if (how_.restoring == Adoption::Restoring::everything) window.installEventFilter(this);
}

// A user cannot make the window smaller than its minimum. So it is a layout that wants more, now
// that commands have changed what it holds, if the window grows to its minimum.
bool AdoptedForm::eventFilter(QObject*, QEvent* event) {
  if (event->type() != QEvent::Resize) return false;
  const QSize before = static_cast<QResizeEvent*>(event)->oldSize();
  const QSize now = window_->size();
  const bool isForced =
      before.isValid() && now != before && now == before.expandedTo(window_->minimumSize());
  if (isForced) trace_.remember({window_.data(), &sizeFacet(), before}, now);
  return false;
}

QWidget* AdoptedForm::content() const {
  const auto* const mainWindow = qobject_cast<const QMainWindow*>(window_.data());
  const bool isWhole = how_.reading == Adoption::Reading::everyTaggedWidget;
  QWidget* const central = mainWindow ? mainWindow->centralWidget() : window_.data();
  return central || !isWhole ? central : window_.data();
}

void AdoptedForm::list(Listing& found) const {
  const QWidget* const around = content();
  if (!around) return;
  if (how_.reading == Adoption::Reading::everyTaggedWidget) return addTagged(*window_, found);
  for (QObject* const child : around->children()) {
    if (isSubview(child)) found.controls.push_back(static_cast<QWidget*>(child));
  }
  addTaggedInPanels(found);
}

void AdoptedForm::addTaggedInPanels(Listing& found) const {
  for (QObject* const child : window_->children()) {
    const QWidget* const panel = widgetAt(child);
    if (panel && isPanel(*panel)) addTagged(*panel, found);
  }
}

// The pages of a stack come in their own order: Qt puts the current one behind the others in the
// list of children.
void AdoptedForm::addTagged(const QWidget& around, Listing& found) const {
  if (around.children().isEmpty()) return;  // as most widgets; casts take longer
  const auto* const stack = qobject_cast<const QStackedWidget*>(&around);
  const int pages = stack ? stack->count() : 0;
  if (stack) found.stacks.emplace_back(stack, pages);
  for (int i = 0; i < pages; ++i) addTaggedFrom(*stack->widget(i), found);
  for (QObject* const child : around.children()) {
    QWidget* const widget = widgetAt(child);
    const bool isPage = stack && widget && stack->indexOf(widget) >= 0;
    if (widget && !isPage && isPartOfForm(*widget)) addTaggedFrom(*widget, found);
  }
}

void AdoptedForm::addTaggedFrom(QWidget& widget, Listing& found) const {
  if (hasTagProperty(widget) || givenTag(widget)) found.controls.push_back(&widget);
  const auto* const menu = widget.isWindow() ? qobject_cast<const QMenu*>(&widget) : nullptr;
  if (menu) addActionsOf(*menu, found.controls);
  addTagged(widget, found);
}

void AdoptedForm::addActionsOf(const QMenu& menu, std::vector<QObject*>& found) const {
  for (QAction* const shown : menu.actions()) {
    QAction* const action = ActionStandIn::actionBehind(*shown);
    if (!action || !isTagged(*action) || action->menu()) continue;
    const bool isKnown = std::find(found.begin(), found.end(), action) != found.end();
    if (!isKnown && !isInToolBarOf(*window_, *action)) found.push_back(action);
  }
}

std::optional<Tag> AdoptedForm::namedTag(const QObject& object) const {
  if (how_.tags.empty()) return std::nullopt;
  const auto named = how_.tags.find(object.objectName());
  return named == how_.tags.end() ? std::nullopt : std::optional(named->second);
}

std::optional<Tag> AdoptedForm::givenTag(const QObject& object) const {
  if (const auto named = namedTag(object)) return named;
  const auto* const widget = qobject_cast<const QWidget*>(&object);
  const QAction* const action = widget ? actionShownBy(*widget) : nullptr;
  if (!action) return std::nullopt;
  if (hasTagProperty(*action)) return Tag{action->property(tagProperty).toLongLong()};
  return namedTag(*action);
}

bool AdoptedForm::isTagged(const QObject& object) const {
  return hasTagProperty(object) || namedTag(object);
}

std::string AdoptedForm::complaintAbout(const QObject& object) const {
  const Tag tag = hasTagProperty(object) ? Tag{object.property(tagProperty).toLongLong()}
                                         : namedTag(object).value_or(0);
  const bool isWhole = how_.reading == Adoption::Reading::everyTaggedWidget;
  return "No command can reach the tag " + std::to_string(tag) + " of the " +
         object.metaObject()->className() + " \"" + utf8(object.objectName()) + "\": " +
         (isWhole ? "only widgets inside the window, and actions in its menus and tool bars, are "
                    "controls"
                  : "only the direct children of the window's content are controls");
}

std::vector<std::string> AdoptedForm::unreachableTags() const {
  std::vector<std::string> complaints;
  Listing found;
  list(found);
  QObjectList objects = window_->findChildren<QObject*>();
  objects.prepend(window_);
  for (const QObject* const object : objects) {
    if (isTagged(*object) && !isReached(*object, found.controls)) {
      complaints.push_back(complaintAbout(*object));
    }
  }
  for (const auto& [name, tag] : how_.tags) {
    const auto isNamed = [&named = name](QObject* object) { return object->objectName() == named; };
    if (std::any_of(objects.begin(), objects.end(), isNamed)) continue;
    complaints.push_back("No command can reach the tag " + std::to_string(tag) +
                         ": the window has no object with the name \"" + utf8(name) + "\"");
  }
  return complaints;
}

std::vector<Sighting> AdoptedForm::look(QWidget& widget, Aspect aspect, Notice notice) const {
  if (how_.restoring == Adoption::Restoring::tags) return {};
  return sightingsAround({.widget = widget,
                          .aspect = aspect,
                          .bringsIntoView = how_.bringsIntoView && notice != Notice::none,
                          .withReactions = notice == Notice::shown && isHeardByHosts(widget)});
}

std::vector<Sighting> AdoptedForm::look(QAction& action) const {
  if (how_.restoring == Adoption::Restoring::tags || !window_) return {};
  return sightingsAround(action, *window_, action.isCheckable());
}

void AdoptedForm::changed(QWidget* widget, Notice notice, const std::vector<Sighting>& before) {
  if (widget && !isOver_) attend(*widget, notice);
  trace_.note(before);
  if (isOver_) trace_.undo();
}

void AdoptedForm::restore() {
  isOver_ = true;
  trace_.undo();
}

void AdoptedForm::attend(QWidget& widget, Notice notice) {
  if (!how_.bringsIntoView || notice == Notice::none || isKeptHidden(widget)) return;
  if (notice == Notice::flash && !flashed_.insert(&widget).second) return;
  bringIntoView(widget);
}

}  // namespace qz::toolkit::qt
