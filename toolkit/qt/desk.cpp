// SPDX-License-Identifier: MIT
// Finds views and windows by their widgets. The entry of a deleted widget may stay under the
// address of a new widget until the old view ends, so look-ups compare the view's current widget.

#include "toolkit/qt/desk.hpp"

#include <algorithm>
#include <utility>

#include "toolkit/qt/action_view.hpp"
#include "toolkit/qt/views.hpp"
#include "toolkit/qt/window.hpp"

namespace qz::toolkit::qt {

Ref<View> Desk::viewOf(QWidget& widget) {
  const auto found = views_.find(&widget);
  const auto known = found == views_.end() ? nullptr : found->second.lock();
  if (known && known->widget() == &widget) return known->view();
  return makeView(widget, shared_from_this(), KeptBy::host)->view();
}

Ref<View> Desk::viewOf(QAction& action) {
  auto& entry = actions_[&action];
  auto known = entry.lock();
  if (!known || known->action() != &action) {
    known = std::make_shared<QtAction>(action, shared_from_this());
    entry = known;
  }
  return {known};
}

Ref<View> Desk::viewOf(QObject& object) {
  return object.isWidgetType() ? viewOf(static_cast<QWidget&>(object))
                               : viewOf(static_cast<QAction&>(object));
}

std::shared_ptr<QtWindow> Desk::windowOf(QWidget& widget) {
  if (auto known = knownWindow(widget)) return known;
  return QtWindow::make(widget, shared_from_this(), KeptBy::host);
}

std::shared_ptr<QtWindow> Desk::knownWindow(const QWidget& widget) const {
  const auto found = windows_.find(&widget);
  const auto known = found == windows_.end() ? nullptr : found->second.lock();
  return known && known->widget() == &widget ? known : nullptr;
}

std::vector<std::shared_ptr<QtWindow>> Desk::windows() const {
  std::vector<std::shared_ptr<QtWindow>> windows;
  for (const auto& [key, window] : windows_) {
    if (auto known = window.lock()) windows.push_back(std::move(known));
  }
  return windows;
}

void Desk::enter(const QWidget& widget, const std::shared_ptr<WidgetNode>& view) {
  views_.insert_or_assign(&widget, view);
}

void Desk::enter(const QWidget& widget, const std::shared_ptr<QtWindow>& window) {
  windows_.insert_or_assign(&widget, window);
}

void Desk::forgetView(const QWidget* key) {
  const auto found = views_.find(key);
  if (found != views_.end() && found->second.expired()) views_.erase(found);
}

void Desk::forgetAction(const QAction* key) {
  const auto found = actions_.find(key);
  if (found != actions_.end() && found->second.expired()) actions_.erase(found);
}

void Desk::forgetWindow(const QWidget* key) {
  const auto found = windows_.find(key);
  if (found != windows_.end() && found->second.expired()) windows_.erase(found);
}

void Desk::keep(const std::shared_ptr<QtWindow>& window) {
  if (std::find(kept_.begin(), kept_.end(), window) == kept_.end()) kept_.push_back(window);
}

void Desk::letGo(const QtWindow& window) {
  const auto place = std::find_if(kept_.begin(), kept_.end(),
                                  [&](const auto& kept) { return kept.get() == &window; });
  if (place == kept_.end()) return;
  const auto last = std::move(*place);  // its end may call this again, so the list must be whole
  kept_.erase(place);
}

void Desk::letAllGo() { const auto last = std::exchange(kept_, {}); }

}  // namespace qz::toolkit::qt
